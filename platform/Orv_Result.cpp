#include "Orv_Result.h"

#include "Orv_ResultsCB.h"

Orv_Result::Orv_Result(boost::shared_ptr<Orv_ResultsCB> callback, bool finalResult)
    : mCallback(std::move(callback))
    , mFinalResult(finalResult)
{
}

Orv_Result::Orv_Result(const Orv_Result& other) = default;
Orv_Result& Orv_Result::operator=(const Orv_Result& other) = default;
Orv_Result::~Orv_Result() = default;

Orv_RequestID Orv_Result::getRequestID() const
{
    return mCallback ? mCallback->getCallbackID() : Orv_RequestID();
}

bool Orv_Result::isFinalResult() const
{
    return mFinalResult;
}
