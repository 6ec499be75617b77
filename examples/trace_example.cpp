// A request processed through the engine with tracing on: prints the trace
// lines and the answers the callback receives.
//
// It plays both sides in one file: the "backend" part derives a concrete
// request from the catalogue class Zel_GetApplicationSettingsReq and answers
// with a small result class; the "application" part implements the callback.
#include "Orv.h"
#include "Orv_Engine.h"
#include "Orv_ResultsCB.h"
#include "Zel_Debug.h"
#include "Zel_Error.h"
#include "Zel_GetApplicationSettingsReq.h"
#include "Zel_Res.h"

#include <boost/make_shared.hpp>

#include <QString>

#include <cstdio>
#include <vector>

namespace {

// Application side: receives the answers.
class PrintingCB : public Orv_ResultsCB
{
public:
    PrintingCB() : Orv_ResultsCB(Orv_RequestID(Orv_RequestID::Callback)) {}
    virtual void succeeded(QString text) { std::printf("answer | succeeded: %s\n", qPrintable(text)); }
    virtual void failed(boost::shared_ptr<Zel_Error> error)
    {
        std::printf("answer | failed: %d %s\n", error->getCode(), qPrintable(error->getMsg()));
    }
    virtual void finished() { std::printf("answer | finished\n"); }
};

// Backend side: a result that stores text answers with their error records.
class TextRes : public Zel_Res
{
public:
    TextRes(boost::shared_ptr<PrintingCB> cb, bool finalResult) : Zel_Res(cb, finalResult), mCB(cb) {}
    void setResult(const QString& text, boost::shared_ptr<Zel_Error> error) { mItems.push_back({text, error}); }

    bool haveResults() override { return mNext < mItems.size(); }
    bool isCurrentResultError() override { return !haveResults() || mItems[mNext].error->isError(); }
    void doSucceeded() override { mCB->succeeded(mItems[mNext++].text); }
    void doFailed() override { mCB->failed(mItems[mNext++].error); }
    void doFinished() override { mCB->finished(); }

private:
    struct Item {
        QString text;
        boost::shared_ptr<Zel_Error> error;
    };
    boost::shared_ptr<PrintingCB> mCB;
    std::vector<Item> mItems;
    std::size_t mNext = 0;
};

// Backend side: the work of the request.
class SettingsReq : public Zel_GetApplicationSettingsReq
{
public:
    explicit SettingsReq(boost::shared_ptr<PrintingCB> cb) : Zel_GetApplicationSettingsReq(cb), mCB(cb) {}
    bool doProcess(boost::shared_ptr<Orv_Result>& result) override
    {
        boost::shared_ptr<TextRes> answer = boost::make_shared<TextRes>(mCB, true);
        answer->setResult(QStringLiteral("<Settings><Language>en</Language></Settings>"), boost::make_shared<Zel_Error>());
        answer->setResult(QString(), boost::make_shared<Zel_Error>(404, QStringLiteral("no workgroup settings")));
        result = answer;
        return true;
    }

private:
    boost::shared_ptr<PrintingCB> mCB;
};

} // namespace

int main()
{
    Orv::setLogHandler([](const char* line) { std::printf("trace  | %s\n", line); });
    Zel_Debug::instance()->setEnabled(true);

    Orv_Engine engine;
    engine.Submit(boost::make_shared<SettingsReq>(boost::make_shared<PrintingCB>()));
    engine.DeliverAll();
    return 0;
}
