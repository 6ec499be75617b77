// Internal: helpers shared by the result classes when they store answers.
// Never installed; include it from sources only.
#ifndef ZEL_RESULTITEMS_P_H
#define ZEL_RESULTITEMS_P_H

#include "Zel_Error.h"

#include <boost/make_shared.hpp>
#include <boost/shared_ptr.hpp>

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

} // namespace ZelResults

#endif
