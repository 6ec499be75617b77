#include "Zel_Res.h"

#include "Orv_ResultsCB.h"

Zel_Res::Zel_Res(boost::shared_ptr<Orv_ResultsCB> callback, bool finalResult)
    : Orv_Result(std::move(callback), finalResult)
{
}

Zel_Res::Zel_Res(const Zel_Res& other) = default;
Zel_Res& Zel_Res::operator=(const Zel_Res& other) = default;
Zel_Res::~Zel_Res() = default;

bool Zel_Res::deliverNext()
{
    bool answer = false;
    if (haveResults()) {
        try {
            if (isCurrentResultError())
                doFailed();
            else
                doSucceeded();
        } catch (...) {
            // A handler's exception must not stop delivery of the other answers.
        }
        if (haveResults()) {
            answer = true;
        } else if (isFinalResult()) {
            try {
                doFinished();
            } catch (...) {
            }
        }
    } else if (isFinalResult()) {
        try {
            doFinished();
        } catch (...) {
        }
    }
    return answer;
}
