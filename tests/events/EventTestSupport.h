// Test support for the events tests: a listener that records what it
// receives in a shared log, and small helpers to build and deliver events.
#ifndef ZEL_TESTS_EVENTTESTSUPPORT_H
#define ZEL_TESTS_EVENTTESTSUPPORT_H

#include "Zel_Event.h"
#include "Zel_EventCB.h"
#include "Zel_EventChildAdded.h"
#include "Zel_EventChildRemoved.h"
#include "Zel_EventChildUpdated.h"
#include "Zel_EventListener.h"
#include "Zel_EventRes.h"
#include "Zel_Session.h"

#include <QString>
#include <QStringList>
#include <boost/shared_ptr.hpp>

#include <functional>
#include <mutex>

#include <pthread.h>

inline boost::shared_ptr<QString> moniker(const char* text)
{
    return boost::shared_ptr<QString>(new QString(QString::fromLatin1(text)));
}

inline QString text(const boost::shared_ptr<QString>& value)
{
    return value ? *value : QStringLiteral("<null>");
}

// Lines "<listener>:<event rendering>" in call order; thread-safe.
class EventLog
{
public:
    void add(const QString& line)
    {
        std::lock_guard<std::mutex> lock(mMutex);
        mLines.append(line);
    }
    QStringList lines() const
    {
        std::lock_guard<std::mutex> lock(mMutex);
        return mLines;
    }
    void clear()
    {
        std::lock_guard<std::mutex> lock(mMutex);
        mLines.clear();
    }

private:
    mutable std::mutex mMutex;
    QStringList mLines;
};

// Records every event the hub hands it (whatever its mask says) and whether
// the listener's own mask accepts it: "<name>" or "<name>(off)".
class RecordingListener : public Zel_EventListener
{
public:
    RecordingListener(EventLog* log, const QString& name, boost::shared_ptr<QString> key, unsigned long mask = 7,
                      boost::shared_ptr<Zel_Session> session = boost::shared_ptr<Zel_Session>())
        : Zel_EventListener(key, mask, session), mLog(log), mName(name)
    {
    }
    ~RecordingListener() override
    {
        if (onDestroy)
            onDestroy();
    }

    std::function<void(RecordingListener&)> onEvent; // runs inside handleEvent, before the event is logged
    std::function<void()> onDestroy;                  // runs in the destructor

    using Zel_EventListener::getMoniker;
    using Zel_EventListener::getSessionSP;
    using Zel_EventListener::isEnabled;

protected:
    void handleEvent(boost::shared_ptr<Zel_Event> event) override
    {
        if (onEvent)
            onEvent(*this);
        if (mLog)
            mLog->add(mName + (isEnabled(event) ? QString() : QStringLiteral("(off)")) + QLatin1Char(':')
                      + event->toZelString());
    }
    const unsigned long getValidEventMask() const override { return 7; }

private:
    EventLog* mLog;
    QString mName;
};

inline boost::shared_ptr<Zel_Event> addedEvent(const char* parent, const char* child)
{
    return boost::shared_ptr<Zel_Event>(new Zel_EventChildAdded(parent ? moniker(parent) : boost::shared_ptr<QString>(),
                                                                child ? moniker(child) : boost::shared_ptr<QString>()));
}

// Delivers the event through an event result, as the engine would.
inline bool deliver(const boost::shared_ptr<Zel_EventCB>& hub, const boost::shared_ptr<Zel_Event>& event)
{
    Zel_EventRes result(hub, event);
    return result.deliverNext();
}

// Runs the function on a new POSIX thread, waits for it, and answers the value
// the thread ended with: the function's answer, or what pthread_exit was given
// (PTHREAD_CANCELED for a cancelled thread).
inline void* runOnPosixThread(std::function<void*()> body)
{
    struct Trampoline {
        static void* run(void* function) { return (*static_cast<std::function<void*()>*>(function))(); }
    };
    pthread_t thread;
    if (pthread_create(&thread, nullptr, &Trampoline::run, &body) != 0)
        return nullptr;
    void* ended = nullptr;
    pthread_join(thread, &ended);
    return ended;
}

#endif
