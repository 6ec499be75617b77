#include "Zel_Req.h"

#include "Zel_Debug.h"
#include "zel_qtcompat_p.h"

#include "Orv_Result.h"
#include "Orv_ResultQ.h"
#include "Orv_ResultsCB.h"

// The engine's name is Latin-1, the encoding getName() and the trace log read
// it in (QString::toStdString() gives UTF-8 since Qt 5).
Zel_Req::Zel_Req(QString name, boost::shared_ptr<Orv_ResultsCB> callback)
    : Orv_Request(name.toLatin1().toStdString(), std::move(callback))
{
}

Zel_Req::Zel_Req(const Zel_Req& other)
    : Orv_Request(other)
    , mResultQ(other.mResultQ)
{
}

Zel_Req::~Zel_Req() = default;

// The stored length counts, so that a NUL inside the name does not cut it.
const QString Zel_Req::getName() const
{
    const std::string& stored = name();
    return QString::fromLatin1(stored.data(), static_cast<int>(stored.size()));
}

boost::shared_ptr<Orv_ResultQ> Zel_Req::getORVResultQ() const
{
    return mResultQ;
}

bool Zel_Req::process(boost::shared_ptr<Orv_ResultQ> resultQ)
{
    mResultQ = std::move(resultQ);

    const boost::shared_ptr<Zel_Debug> debug = Zel_Debug::instance();
    QString idText;
    ZelCompat::ElapsedTimer timer;
    if (debug->getEnabled()) {
        idText = QStringLiteral(" ID:") + QString::number(static_cast<long>(getRequestID().getValue()), 10)
            + QLatin1Char(')');
        debug->debug(getName(), QStringLiteral("processing request") + idText, 0);
        timer.start();
    }

    bool answer = false;
    if (mResultQ) {
        boost::shared_ptr<Orv_Result> result;
        answer = doProcess(result);
        if (result)
            mResultQ->Push(result);
    }

    if (debug->getEnabled()) {
        // Tracing switched on during the work: the timer never ran, report 0.
        const int elapsed = timer.isValid() ? static_cast<int>(timer.elapsed()) : 0;
        debug->debug(getName(), QStringLiteral("processed request") + idText, elapsed);
    }
    return answer;
}
