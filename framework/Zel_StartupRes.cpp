#include "Zel_StartupRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_StartupRes::Zel_StartupRes(boost::shared_ptr<Zel_StartupCB> callback, bool finalResult)
    : Orv_Result(callback, finalResult)
    , mCallback(std::move(callback))
{
}

Zel_StartupRes::Zel_StartupRes(const Zel_StartupRes& other) = default;
Zel_StartupRes& Zel_StartupRes::operator=(const Zel_StartupRes& other) = default;
Zel_StartupRes::~Zel_StartupRes() = default;

bool Zel_StartupRes::deliverNext()
{
    // A handler's exception is discarded.
    ZelResults::discardExceptions([this] {
        if (mCallback && mError) {
            if (mError->isError())
                mCallback->failed(mError);
            else
                mCallback->succeeded();
        }
    });
    return false;
}

// An empty pointer leaves no record: nothing is delivered until a record is
// set again, rather than a made-up success.
void Zel_StartupRes::setError(boost::shared_ptr<Zel_Error> error)
{
    mError = std::move(error);
}
