#include "Zel_Res.h"

#include "zel_resultitems_p.h"

#include "Orv_ResultsCB.h"

namespace {

// Tells a final result's callback that the request has delivered its last
// answer; the answer of the delivery call is then false.
bool finishIfFinal(Zel_Res& result)
{
    if (result.isFinalResult())
        ZelResults::discardExceptions([&result] { result.doFinished(); });
    return false;
}

// Ends a call in which haveResults() or isCurrentResultError() threw. With a
// cursor, delivery goes on after the current answer (skip) or after the one
// just delivered; without one, nothing tells where the next answer is, so the
// result ends rather than asking the same question for ever.
bool endAfterThrowingQuestion(Zel_Res& result, bool (*cursor)(Zel_Res&, bool), bool skip)
{
    if (cursor && cursor(result, skip))
        return true;
    return finishIfFinal(result);
}

} // namespace

Zel_Res::Zel_Res(boost::shared_ptr<Orv_ResultsCB> callback, bool finalResult)
    : Orv_Result(std::move(callback), finalResult)
{
}

Zel_Res::Zel_Res(const Zel_Res& other) = default;
Zel_Res& Zel_Res::operator=(const Zel_Res& other) = default;
Zel_Res::~Zel_Res() = default;

bool Zel_Res::deliverNext()
{
    return deliverNextStep(nullptr);
}

bool Zel_Res::deliverNextStep(AnswerCursor cursor)
{
    // The common path has one try block; what follows an exception lives in
    // deliverAfterException().
    DeliveryStage stage = AskingForAnswer;
    try {
        if (haveResults()) {
            const bool failed = isCurrentResultError();
            stage = InHandler;
            if (failed)
                doFailed();
            else
                doSucceeded();
            stage = AskingForMore;
            if (haveResults())
                return true;
        }
    } catch (...) {
        return deliverAfterException(stage, cursor);
    }
    return finishDelivery();
}

bool Zel_Res::deliverAfterException(DeliveryStage stage, AnswerCursor cursor)
{
    // Only ever called from a catch handler: rethrows what it caught when
    // that is the unwinding that cancels a thread.
    ZelResults::discardExceptions([] { throw; });
    switch (stage) {
    case AskingForAnswer:
        return endAfterThrowingQuestion(*this, cursor, true);
    case InHandler: {
        // A handler's exception must not stop delivery of the other answers.
        bool more = false;
        if (ZelResults::discardExceptions([&] { more = haveResults(); }))
            return endAfterThrowingQuestion(*this, cursor, false);
        return more || finishIfFinal(*this);
    }
    case AskingForMore:
        break;
    }
    return endAfterThrowingQuestion(*this, cursor, false);
}

bool Zel_Res::finishDelivery()
{
    return finishIfFinal(*this);
}
