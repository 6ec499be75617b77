// Zel_GenericRes: the delivery operations shared by the generic result classes.
//
// Twenty-odd result classes (Zel_GetNodeRes, Zel_SettingsRes, Zel_ChildrenRes,
// ...) have one shape: a typed callback, a std::vector of nested ResultItem
// values (payload plus error record) and an unsigned 64-bit cursor. They differ
// only in the payload and in which handler receives it. Each stays an ordinary
// exported class with its own header that declares its ResultItem, its three
// fields in its own order and its setResult, and derives from this template
// named after itself:
//
//     class ZEL_EXPORT Zel_GetNodeRes : public Zel_GenericRes<Zel_GetNodeRes, Zel_ResultCB>
//
// The template implements the five delivery operations of Zel_Res once, on
// the derived class's fields. A base template rather than a member or helper
// functions because it adds no virtual slot and no data: the vtable stays that
// of Zel_Res followed by the derived class's setResult, and the field layout is
// exactly the one the derived class declares (some classes keep the items and
// the cursor before the callback).
//
// The derived class makes this base a friend and provides:
//   mCallback   boost::shared_ptr<Callback>    the typed callback
//   mItems      std::vector<ResultItem>         the answers, in the order added
//   mCursor     quint64                         index of the next answer
//   ResultItem::mError                          the answer's error record
//   static void callSucceeded(Callback&, const ResultItem&)
//               hands the item's payload to the success handler
//   static void callFailed(Callback&, const ResultItem&)
//               optional; by default failed(item.mError)
//
// Delivery: doSucceeded and doFailed take the item at the cursor, move the
// cursor past it and only then call the handler, with copies of the item's
// values (the handler's by-value parameters; nothing else is copied). A result
// whose callback is empty still consumes its items, so deliverNext() comes to
// return false. An empty error record counts as "no error". When
// haveResults() or isCurrentResultError() throws (an error record whose code
// cannot be read, or a derived class's override), the call ends and the cursor
// passes over the current item. No lock is taken: a result is filled by one
// thread, then delivered.
//
// Speed: deliverNext() is defined here, so the compiler sees the five
// operations of the class and may call them directly once it has checked that
// the object's virtual slots hold them (a derived class that replaces one is
// still called through its slot). The common path has a single try block; what
// follows an exception is Zel_Res's. While one item is handed over, the next
// item's error record and node are fetched into the cache.
#ifndef ZEL_GENERICRES_H
#define ZEL_GENERICRES_H

#include "zel_export.h"
#include "Zel_Error.h"
#include "Zel_Res.h"

#include <boost/shared_ptr.hpp>

#include <cstddef>
#include <utility>

template <class Derived, class Callback>
class ZEL_EXPORT Zel_GenericRes : public Zel_Res
{
public:
    Zel_GenericRes(boost::shared_ptr<Orv_ResultsCB> callback, bool finalResult)
        : Zel_Res(std::move(callback), finalResult)
    {
    }
    Zel_GenericRes(const Zel_GenericRes& other) = default;
    Zel_GenericRes& operator=(const Zel_GenericRes& other) = default;

    // The delivery of Zel_Res; when a question about the current item throws,
    // the next call goes on with the item after it. The same steps as
    // Zel_Res::deliverNextStep, here where the compiler sees this class's own
    // operations: it may call them directly (after checking that the object's
    // virtual slots still hold them) instead of through the slots.
    bool deliverNext() override
    {
        DeliveryStage stage = AskingForAnswer;
        try {
            if (this->haveResults()) {
                const bool failed = this->isCurrentResultError();
                stage = InHandler;
                if (failed)
                    this->doFailed();
                else
                    this->doSucceeded();
                stage = AskingForMore;
                if (this->haveResults())
                    return true;
            }
        } catch (...) {
            return deliverAfterException(stage, &Zel_GenericRes::stepCursor);
        }
        return finishDelivery();
    }

    // Makes room for count more answers ahead of filling a long result, so
    // that adding them does not move the ones stored; delivery is unchanged.
    void reserveResults(std::size_t count)
    {
        auto& items = derived().mItems;
        items.reserve(items.size() + count);
    }

    // True while the cursor is below the number of items.
    bool haveResults() override
    {
        const Derived& self = derived();
        return self.mItems.size() > self.mCursor;
    }

    // True when there is no current item or its error record reports an error.
    bool isCurrentResultError() override
    {
        const Derived& self = derived();
        if (self.mCursor >= self.mItems.size())
            return true;
        const auto& item = self.mItems[static_cast<std::size_t>(self.mCursor)];
        return item.mError && item.mError->isError();
    }

    // Consumes the current item and hands it to the failure handler.
    void doFailed() override
    {
        Derived& self = derived();
        if (self.mCursor >= self.mItems.size())
            return;
        const auto& item = takeCurrent(self);
        if (self.mCallback)
            Derived::callFailed(*self.mCallback, item);
    }

    // Consumes the current item and hands its payload to the success handler.
    void doSucceeded() override
    {
        Derived& self = derived();
        if (self.mCursor >= self.mItems.size())
            return;
        const auto& item = takeCurrent(self);
        if (self.mCallback)
            Derived::callSucceeded(*self.mCallback, item);
    }

    // Moves the cursor past the end and tells the callback the request is done.
    void doFinished() override
    {
        Derived& self = derived();
        if (!self.mCallback)
            return;
        ++self.mCursor;
        self.mCallback->finished();
    }

protected:
    // The failure handler of the common shape: failed(error record).
    template <class Item>
    static void callFailed(Callback& callback, const Item& item)
    {
        callback.failed(item.mError);
    }

private:
    Derived& derived() { return static_cast<Derived&>(*this); }

    // The item at the cursor (which the caller has checked), the cursor moved
    // past it. Asks for the next item's error record and node (where items
    // carry one, as mNode) to be brought into the cache meanwhile: over long
    // results the handler's copy of each payload would otherwise wait for
    // memory, after the work of the delivery call rather than during it.
    static const auto& takeCurrent(Derived& self)
    {
        const std::size_t current = static_cast<std::size_t>(self.mCursor++);
        if (current + 1 < self.mItems.size()) {
            const auto& next = self.mItems[current + 1];
            prefetch(next.mError.get());
            prefetchNode(next, 0);
        }
        return self.mItems[current];
    }

    static void prefetch(const void* address)
    {
#if defined(__GNUC__)
        __builtin_prefetch(address);
#else
        (void)address;
#endif
    }
    template <class Item>
    static auto prefetchNode(const Item& item, int) -> decltype(item.mNode.get(), void())
    {
        prefetch(item.mNode.get());
    }
    template <class Item>
    static void prefetchNode(const Item&, long)
    {
    }

    static bool stepCursor(Zel_Res& result, bool skip)
    {
        Derived& self = static_cast<Derived&>(result);
        if (skip && self.mCursor < self.mItems.size())
            ++self.mCursor;
        return self.mCursor < self.mItems.size();
    }
};

#endif
