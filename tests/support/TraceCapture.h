// Test support: captures what the trace log writes to its two outputs, Qt's
// debug output and the engine's log, for the life of the object.
#ifndef ZEL_TESTS_TRACECAPTURE_H
#define ZEL_TESTS_TRACECAPTURE_H

#include "Orv.h"
#include "Zel_Debug.h"

#include <QString>
#include <QStringList>
#include <QtGlobal>

#include <mutex>
#include <string>
#include <vector>

class TraceCapture
{
public:
    // Turns tracing on (or leaves it off) and starts capturing.
    explicit TraceCapture(bool enableTracing = true)
    {
        current() = this;
        mPreviousTracing = Zel_Debug::instance()->getEnabled();
        Zel_Debug::instance()->setEnabled(enableTracing);
        mPreviousQt = qInstallMessageHandler(&TraceCapture::qtHandler);
        mPreviousOrv = Orv::setLogHandler([this](const char* line) {
            std::lock_guard<std::mutex> lock(mMutex);
            mOrvLines.push_back(line);
        });
    }
    ~TraceCapture()
    {
        Orv::setLogHandler(mPreviousOrv);
        qInstallMessageHandler(mPreviousQt);
        Zel_Debug::instance()->setEnabled(mPreviousTracing);
        current() = nullptr;
    }

    // Lines given to Orv::log, in order.
    std::vector<std::string> orvLines() const
    {
        std::lock_guard<std::mutex> lock(mMutex);
        return mOrvLines;
    }
    // Lines written to Qt's debug output, in order.
    QStringList qtLines() const
    {
        std::lock_guard<std::mutex> lock(mMutex);
        return mQtLines;
    }

private:
    static TraceCapture*& current()
    {
        static TraceCapture* capture = nullptr;
        return capture;
    }
    static void qtHandler(QtMsgType, const QMessageLogContext&, const QString& message)
    {
        if (TraceCapture* capture = current()) {
            std::lock_guard<std::mutex> lock(capture->mMutex);
            capture->mQtLines.append(message);
        }
    }

    mutable std::mutex mMutex;
    std::vector<std::string> mOrvLines;
    QStringList mQtLines;
    bool mPreviousTracing = false;
    QtMessageHandler mPreviousQt = nullptr;
    Orv::LogHandler mPreviousOrv;
};

#endif
