// Zel_DirCB: the callback of Zel_DirReq. One answer per directory.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error, finished after the last answer of the
// request) on the engine's delivery thread.
#ifndef ZEL_DIRCB_H
#define ZEL_DIRCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Directory;
class Zel_Error;

class ZEL_EXPORT Zel_DirCB : public Orv_ResultsCB
{
public:
    Zel_DirCB();
    Zel_DirCB(const Zel_DirCB& other);
    virtual ~Zel_DirCB();

    // One answer: a directory.
    virtual void succeeded(boost::shared_ptr<Zel_Directory> directory) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_DirCB& operator=(const Zel_DirCB&) = delete;
};

#endif
