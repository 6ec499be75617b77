// The delivery protocol of Zel_Res, exercised through a result class of the
// generic shape (typed callback, items with error records, cursor) local to
// this test.
#include "Orv_ResultsCB.h"
#include "Zel_Error.h"
#include "Zel_Res.h"

#include <boost/make_shared.hpp>
#include <boost/weak_ptr.hpp>
#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <vector>

namespace {

class IntCB : public Orv_ResultsCB
{
public:
    IntCB() : Orv_ResultsCB(Orv_RequestID(Orv_RequestID::Callback)) {}
    virtual void succeeded(int value) = 0;
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    virtual void finished() = 0;
};

class IntRes : public Zel_Res
{
public:
    class ResultItem
    {
    public:
        ResultItem(int value, boost::shared_ptr<Zel_Error> error) : mValue(value), mError(std::move(error)) {}
        virtual ~ResultItem() = default;
        int mValue;
        boost::shared_ptr<Zel_Error> mError;
    };

    IntRes(boost::shared_ptr<IntCB> callback, bool finalResult)
        : Zel_Res(callback, finalResult)
        , mCallback(std::move(callback))
    {
    }

    virtual void setResult(int value, boost::shared_ptr<Zel_Error> error)
    {
        mItems.emplace_back(value, error ? std::move(error) : boost::make_shared<Zel_Error>());
    }

    bool haveResults() override { return mItems.size() > mCursor; }
    bool isCurrentResultError() override { return !haveResults() || mItems[mCursor].mError->isError(); }
    void doSucceeded() override
    {
        if (!haveResults())
            return;
        const ResultItem& item = mItems[mCursor++];
        if (mCallback)
            mCallback->succeeded(item.mValue);
    }
    void doFailed() override
    {
        if (!haveResults())
            return;
        const ResultItem& item = mItems[mCursor++];
        if (mCallback)
            mCallback->failed(item.mError);
    }
    void doFinished() override
    {
        if (mCallback) {
            ++mCursor;
            mCallback->finished();
        }
    }

private:
    boost::shared_ptr<IntCB> mCallback;
    std::vector<ResultItem> mItems;
    unsigned long long mCursor = 0;
};

// Records every handler call as text; can be told to throw on a given call.
class RecordingCB : public IntCB
{
public:
    void succeeded(int value) override { record("succeeded(" + std::to_string(value) + ")"); }
    void failed(boost::shared_ptr<Zel_Error> error) override
    {
        record("failed(" + std::to_string(error->getCode()) + ")");
    }
    void finished() override { record("finished"); }

    std::vector<std::string> calls;
    int throwOnCall = -1;

private:
    void record(std::string call)
    {
        calls.push_back(std::move(call));
        if (static_cast<int>(calls.size()) - 1 == throwOnCall)
            throw std::runtime_error("handler failed");
    }
};

boost::shared_ptr<Zel_Error> ok()
{
    return boost::make_shared<Zel_Error>();
}

boost::shared_ptr<Zel_Error> err(int code)
{
    return boost::make_shared<Zel_Error>(code, QStringLiteral("failure"));
}

using Calls = std::vector<std::string>;

} // namespace

TEST(Zel_ResTest, DeliversOneItemPerCallThenFinishesOnLastItem)
{
    auto cb = boost::make_shared<RecordingCB>();
    IntRes result(cb, true);
    result.setResult(1, ok());
    result.setResult(2, err(7));
    result.setResult(3, ok());
    EXPECT_TRUE(cb->calls.empty()) << "setResult never delivers";

    EXPECT_TRUE(result.deliverNext());
    EXPECT_EQ(cb->calls, (Calls{"succeeded(1)"}));
    EXPECT_TRUE(result.deliverNext());
    EXPECT_EQ(cb->calls, (Calls{"succeeded(1)", "failed(7)"}));
    EXPECT_FALSE(result.deliverNext());
    EXPECT_EQ(cb->calls, (Calls{"succeeded(1)", "failed(7)", "succeeded(3)", "finished"}));

    // Asking again after the end tells the callback once more that it finished.
    EXPECT_FALSE(result.deliverNext());
    EXPECT_EQ(cb->calls.back(), "finished");
    EXPECT_EQ(cb->calls.size(), 5u);
}

TEST(Zel_ResTest, EmptyResultsFinishOnlyWhenFinal)
{
    auto cb = boost::make_shared<RecordingCB>();
    IntRes finalEmpty(cb, true);
    EXPECT_FALSE(finalEmpty.deliverNext());
    EXPECT_EQ(cb->calls, (Calls{"finished"}));

    auto cb2 = boost::make_shared<RecordingCB>();
    IntRes partialEmpty(cb2, false);
    EXPECT_FALSE(partialEmpty.deliverNext());
    EXPECT_TRUE(cb2->calls.empty());

    auto cb3 = boost::make_shared<RecordingCB>();
    IntRes partial(cb3, false);
    partial.setResult(1, ok());
    partial.setResult(2, ok());
    EXPECT_TRUE(partial.deliverNext());
    EXPECT_FALSE(partial.deliverNext());
    EXPECT_FALSE(partial.deliverNext());
    EXPECT_EQ(cb3->calls, (Calls{"succeeded(1)", "succeeded(2)"}));
}

TEST(Zel_ResTest, HandlerExceptionIsDiscardedAndDeliveryGoesOn)
{
    for (int thrower = 0; thrower < 4; ++thrower) {
        auto cb = boost::make_shared<RecordingCB>();
        cb->throwOnCall = thrower; // first, middle and last item, then the end notice
        IntRes result(cb, true);
        result.setResult(1, ok());
        result.setResult(2, err(3));
        result.setResult(4, ok());

        std::vector<bool> answers;
        for (int i = 0; i < 3; ++i)
            answers.push_back(result.deliverNext());
        EXPECT_EQ(answers, (std::vector<bool>{true, true, false})) << "thrower " << thrower;
        EXPECT_EQ(cb->calls, (Calls{"succeeded(1)", "failed(3)", "succeeded(4)", "finished"}))
            << "thrower " << thrower;
    }
}

TEST(Zel_ResTest, NullErrorCountsAsSuccess)
{
    auto cb = boost::make_shared<RecordingCB>();
    IntRes result(cb, true);
    result.setResult(5, boost::shared_ptr<Zel_Error>());
    EXPECT_FALSE(result.deliverNext());
    EXPECT_EQ(cb->calls, (Calls{"succeeded(5)", "finished"}));
}

TEST(Zel_ResTest, EmptyCallbackStillConsumesItems)
{
    IntRes result(boost::shared_ptr<IntCB>(), true);
    result.setResult(1, ok());
    result.setResult(2, err(1));
    EXPECT_TRUE(result.deliverNext());
    EXPECT_FALSE(result.deliverNext());
    EXPECT_FALSE(result.deliverNext());
}

TEST(Zel_ResTest, CallbackOutlivesTheApplicationsReference)
{
    boost::weak_ptr<RecordingCB> watch;
    boost::shared_ptr<IntRes> result;
    {
        auto cb = boost::make_shared<RecordingCB>();
        watch = cb;
        result = boost::make_shared<IntRes>(cb, true);
        result->setResult(1, ok());
    }
    ASSERT_FALSE(watch.expired());
    EXPECT_FALSE(result->deliverNext());
    EXPECT_EQ(watch.lock()->calls.size(), 2u);
    result.reset();
    EXPECT_TRUE(watch.expired());
}
