// Internal: the result class of this backend for the callbacks the library
// answers with no result of its own (login, root node, properties, frame
// locators and restrictions, query, move, rename, copy, ...).
//
// One template serves every such callback: an answer is a deferred call of one
// of the callback's handlers plus its error record. An answer whose record
// reports an error goes to failed(error); every other answer makes its call
// (succeeded with the payload, or another handler such as progress or
// conditionFailed). finished() follows the last answer of a final result when
// the callback has such a handler (login and root-node callbacks have none).
// The delivery protocol is Zel_Res's: one answer per deliverNext().
#ifndef ZEL_SERVER_RESULTS_P_H
#define ZEL_SERVER_RESULTS_P_H

#include "Zel_Error.h"
#include "Zel_Res.h"

#include <boost/shared_ptr.hpp>

#include <cstddef>
#include <functional>
#include <type_traits>
#include <utility>
#include <vector>

namespace ZelMemory {

template <class CB, class = void>
struct HasFinished : std::false_type {
};
template <class CB>
struct HasFinished<CB, decltype(std::declval<CB&>().finished())> : std::true_type {
};

template <class CB>
class MemoryRes : public Zel_Res
{
public:
    typedef CB Callback;

    MemoryRes(boost::shared_ptr<CB> callback, bool finalResult)
        : Zel_Res(callback, finalResult)
        , mCallback(std::move(callback))
    {
    }

    // An answer for succeeded(args...).
    template <class... Args>
    void succeed(Args... args)
    {
        mItems.push_back(Item{[args...](CB& cb) { cb.succeeded(args...); }, noError()});
    }
    // An answer that calls another handler (progress, conditionFailed, ...).
    void call(std::function<void(CB&)> handler) { mItems.push_back(Item{std::move(handler), noError()}); }
    // An error answer for failed(error).
    void fail(const boost::shared_ptr<Zel_Error>& error) { mItems.push_back(Item{std::function<void(CB&)>(), error}); }

    std::size_t size() const { return mItems.size(); }

    bool haveResults() override { return mCursor < mItems.size(); }
    bool isCurrentResultError() override
    {
        return mCursor >= mItems.size() || (mItems[mCursor].error && mItems[mCursor].error->isError());
    }
    void doFailed() override { deliverCurrent(); }
    void doSucceeded() override { deliverCurrent(); }
    void doFinished() override { finish(HasFinished<CB>()); }

private:
    struct Item {
        std::function<void(CB&)> handler;
        boost::shared_ptr<Zel_Error> error;
    };

    static boost::shared_ptr<Zel_Error> noError() { return boost::shared_ptr<Zel_Error>(new Zel_Error()); }

    void deliverCurrent()
    {
        if (mCursor >= mItems.size())
            return;
        const Item& item = mItems[mCursor++];
        if (!mCallback)
            return;
        if (item.error && item.error->isError())
            mCallback->failed(item.error);
        else if (item.handler)
            item.handler(*mCallback);
    }
    void finish(std::true_type)
    {
        if (mCallback) {
            ++mCursor;
            mCallback->finished();
        }
    }
    void finish(std::false_type) {}

    boost::shared_ptr<CB> mCallback;
    std::vector<Item> mItems;
    std::size_t mCursor = 0;
};

} // namespace ZelMemory

#endif
