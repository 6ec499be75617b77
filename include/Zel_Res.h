// Zel_Res: base of the result classes that deliver stored answers.
//
// A result collects a request's answers (each paired with a Zel_Error) and the
// engine delivers them by calling deliverNext() until it returns false. Each
// call hands exactly one answer to the callback: to its failure handler when
// the answer's error record reports an error, otherwise to its success handler.
// The call that exhausts a final result also calls the finished handler.
// Exceptions thrown by handlers are caught and discarded; delivery goes on
// with the next answer on the next call.
//
// Delivery always comes to an end. When haveResults() or
// isCurrentResultError() throws, the call ends: a result that keeps its
// answers behind a cursor known to delivery (the library's own results) moves
// past the current answer, so the next call sees the next one; any other
// result ends there (a final one still calls the finished handler). The
// exception that cancels a thread (abi::__forced_unwind) is never swallowed.
//
// A concrete result implements the five protected-by-contract operations
// haveResults, isCurrentResultError, doFailed, doSucceeded and doFinished and
// adds its own setResult. A result is filled by one thread, then pushed, then
// delivered; it takes no lock.
#ifndef ZEL_RES_H
#define ZEL_RES_H

#include "zel_export.h"
#include "Orv_Result.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_Res : public Orv_Result
{
public:
    Zel_Res(boost::shared_ptr<Orv_ResultsCB> callback, bool finalResult);
    Zel_Res(const Zel_Res& other);
    Zel_Res& operator=(const Zel_Res& other);
    virtual ~Zel_Res();

    // Delivers one stored answer; true while undelivered answers remain.
    virtual bool deliverNext() override;

    // True while answers remain to be delivered.
    virtual bool haveResults() = 0;
    // True when the current answer is an error (or there is none).
    virtual bool isCurrentResultError() = 0;
    // Hand the current answer to the failure / success handler and move on.
    virtual void doFailed() = 0;
    virtual void doSucceeded() = 0;
    // Tell the callback that the request has delivered its last answer.
    virtual void doFinished() = 0;

protected:
    // The cursor of a result that keeps its answers in order behind an index:
    // moves it past the current answer when skip is true, and answers whether
    // answers remain after it. It must not throw.
    typedef bool (*AnswerCursor)(Zel_Res& result, bool skip);

    // One deliverNext() step. When haveResults() or isCurrentResultError()
    // throws, the cursor (if given) passes over the current answer; without
    // one the result ends.
    bool deliverNextStep(AnswerCursor cursor);

    // Where in a deliverNext() step an exception was thrown.
    enum DeliveryStage {
        AskingForAnswer, // haveResults() or isCurrentResultError() before the handler
        InHandler,       // doFailed() or doSucceeded()
        AskingForMore    // haveResults() after the handler
    };
    // The rest of a deliverNext() step whose operation threw at stage; called
    // from the handler that caught the exception. The exception that cancels
    // a thread is thrown on; every other is discarded and the step goes on as
    // deliverNextStep() describes.
    bool deliverAfterException(DeliveryStage stage, AnswerCursor cursor);
    // The end of a step that found no answer left: a final result's
    // doFinished(), its exceptions discarded; false.
    bool finishDelivery();
};

#endif
