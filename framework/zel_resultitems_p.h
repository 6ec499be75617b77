// Internal: helpers shared by the result classes when they store answers.
// Never installed; include it from sources only.
#ifndef ZEL_RESULTITEMS_P_H
#define ZEL_RESULTITEMS_P_H

#include "Orv_Result.h"
#include "Zel_Error.h"

#include <boost/make_shared.hpp>
#include <boost/shared_ptr.hpp>

#include <cxxabi.h>

namespace ZelResults {

// The error record to store with an answer: the one given or, when the backend
// passed an empty pointer, a fresh "no error" record (code -1), so that every
// stored item carries a record and a handler never receives an empty one.
inline boost::shared_ptr<Zel_Error> errorRecord(boost::shared_ptr<Zel_Error> error)
{
    if (!error)
        error = boost::make_shared<Zel_Error>();
    return error;
}

// Runs operation and discards any exception it throws, except the one that
// cancels a thread (abi::__forced_unwind, thrown by pthread_exit and
// pthread_cancel), which must go on unwinding or the process aborts. True
// when an exception was discarded. Every place where delivery discards
// exceptions goes through here. That exception is no C++ object, so the
// handler that names it binds a reference to null: harmless, but reported by
// UBSan's null check, hence no_sanitize("null") here alone.
template <class Operation>
__attribute__((no_sanitize("null"))) bool discardExceptions(Operation&& operation)
{
    try {
        operation();
    } catch (abi::__forced_unwind&) {
        throw;
    } catch (...) {
        return true;
    }
    return false;
}

// True when the record reports an error; an empty record reports none.
inline bool reportsError(const boost::shared_ptr<Zel_Error>& error)
{
    return error && error->isError();
}

// One deliverNext() call of the check-in results, which keep their own list
// of items: hands the item at the cursor to deliver(item), then, after the
// last item of a final result, calls finished(). The cursor moves before the
// handler runs, and an exception from a handler (or from finished()) is
// discarded, so the remaining items and the end notice still follow. True
// while items remain; nothing thrown here reaches the engine, except the
// exception that cancels a thread (see discardExceptions).
template <class Callback, class Items, class Cursor, class Deliver>
bool deliverListItem(const Orv_Result& result, const boost::shared_ptr<Callback>& callback, const Items& items,
                     Cursor& cursor, Deliver deliver)
{
    bool more = false;
    discardExceptions([&] {
        if (callback && cursor < items.size()) {
            const auto& item = items[static_cast<std::size_t>(cursor++)];
            discardExceptions([&] { deliver(*callback, item); });
            if (cursor < items.size()) {
                more = true;
                return;
            }
        }
        if (callback && result.isFinalResult())
            discardExceptions([&] { callback->finished(); });
    });
    return more;
}

} // namespace ZelResults

#endif
