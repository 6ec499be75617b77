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
    bool have = false;
    bool failed = false;
    if (ZelResults::discardExceptions([&] {
            have = haveResults();
            if (have)
                failed = isCurrentResultError();
        }))
        return endAfterThrowingQuestion(*this, cursor, true);
    if (!have)
        return finishIfFinal(*this);

    // A handler's exception must not stop delivery of the other answers.
    ZelResults::discardExceptions([this, failed] {
        if (failed)
            doFailed();
        else
            doSucceeded();
    });

    bool more = false;
    if (ZelResults::discardExceptions([&] { more = haveResults(); }))
        return endAfterThrowingQuestion(*this, cursor, false);
    if (more)
        return true;
    return finishIfFinal(*this);
}
