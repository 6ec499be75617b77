// Console: how the demo prints.
//
// Every line of the tour goes through here, so that the trace lines written on
// the engine's worker threads never cut into a line of the tour. The layout:
//
//     == 3. Properties ==========================================
//       What the step is about.
//       -> Zel_PropertyListReq for "Interview Mayor"     (a request is sent)
//          <- succeeded: 12 properties                    (a callback answer)
//             Name   Interview Mayor                      (more of the answer)
//          ~~ child added in "Demo Bin": zel-mem://N000004 (a listener event)
//       !! expected ...                                   (a check that failed)
#ifndef ZEL_DEMO_CONSOLE_H
#define ZEL_DEMO_CONSOLE_H

#include <QString>

#include <boost/shared_ptr.hpp>

#include <mutex>

class Zel_Error;
class Zel_Node;

class Console
{
public:
    // The one console of the program.
    static Console& instance();

    // A plain line, as is.
    void line(const QString& text = QString());
    // The heading of a step and the sentence that says what it shows.
    void heading(int number, const QString& title, const QString& intro);
    // A remark of the tour itself.
    void note(const QString& text);
    // A request the application sends.
    void send(const QString& text);
    // An answer a callback received.
    void answer(const QString& text);
    // A further line of the same answer.
    void detail(const QString& text);
    // A notification a listener received.
    void event(const QString& text);
    // Several lines (an XML text), indented below the answer that carried them.
    void block(const QString& text);
    // A check that failed.
    void mismatch(const QString& text);
    // A line of the library's trace log (any thread).
    void trace(const char* line);
    // A message of Qt's own (any thread), to stderr.
    void qtMessage(const QString& text);

private:
    Console() = default;
    void write(const QString& text);

    std::mutex mMutex;
};

// "Interview Mayor" [masterclip]
QString describeNode(const boost::shared_ptr<Zel_Node>& node);
// "PermissionDenied 1003: <message> (privilege error)"; "no error" for a
// record that reports none.
QString describeError(const boost::shared_ptr<Zel_Error>& error);
// The same without the message: "PermissionDenied 1003 (privilege error)".
QString errorHeadline(const boost::shared_ptr<Zel_Error>& error);
// The name of a code of Zel_MemoryErrorCodes ("PermissionDenied"), or the number.
QString errorCodeName(int code);
// The text in double quotes.
QString quoted(const QString& text);

#endif
