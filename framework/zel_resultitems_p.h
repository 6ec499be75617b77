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
// exception that cancels a thread (abi::__forced_unwind), which must go on
// unwinding.
template <class Callback, class Items, class Cursor, class Deliver>
bool deliverListItem(const Orv_Result& result, const boost::shared_ptr<Callback>& callback, const Items& items,
                     Cursor& cursor, Deliver deliver)
{
    try {
        if (callback && cursor < items.size()) {
            const auto& item = items[static_cast<std::size_t>(cursor++)];
            try {
                deliver(*callback, item);
            } catch (abi::__forced_unwind&) {
                throw;
            } catch (...) {
            }
            if (cursor < items.size())
                return true;
        }
        if (callback && result.isFinalResult()) {
            try {
                callback->finished();
            } catch (abi::__forced_unwind&) {
                throw;
            } catch (...) {
            }
        }
    } catch (abi::__forced_unwind&) {
        throw;
    } catch (...) {
    }
    return false;
}

} // namespace ZelResults

#endif
