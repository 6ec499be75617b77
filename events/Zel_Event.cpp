#include "Zel_Event.h"
#include "Zel_EventChildAdded.h"
#include "Zel_EventChildRemoved.h"
#include "Zel_EventChildUpdated.h"

namespace {

QString textOf(const boost::shared_ptr<QString>& moniker)
{
    return moniker ? *moniker : QString();
}

// "<class> parent: <parent> child: <child>"; the parent is read through the
// virtual getMonikerSP() so that a derived event's override takes part.
QString renderChildEvent(const char* className, const Zel_Event& event,
                         const boost::shared_ptr<QString>& child)
{
    return QLatin1String(className) + QLatin1String(" parent: ") + textOf(event.getMonikerSP())
        + QLatin1String(" child: ") + textOf(child);
}

} // namespace

Zel_Event::Zel_Event(boost::shared_ptr<QString> moniker)
    : mMoniker(std::move(moniker))
{
}

Zel_Event::Zel_Event(const Zel_Event& other) = default;

Zel_Event::~Zel_Event() = default;

QString Zel_Event::toZelString()
{
    return QStringLiteral("Zel_Event");
}

const boost::shared_ptr<QString> Zel_Event::getMonikerSP() const
{
    return mMoniker;
}

#define ZEL_DEFINE_CHILD_EVENT(Class, typeCode)                                                    \
    Class::Class(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker) \
        : Zel_Event(std::move(parentMoniker))                                                      \
        , mChildMoniker(std::move(childMoniker))                                                   \
    {                                                                                              \
    }                                                                                              \
    Class::Class(const Class& other) = default;                                                    \
    Class::~Class() = default;                                                                     \
    QString Class::toZelString()                                                                   \
    {                                                                                              \
        return renderChildEvent(#Class, *this, mChildMoniker);                                     \
    }                                                                                              \
    const unsigned long Class::getEventType() const                                                \
    {                                                                                              \
        return typeCode;                                                                           \
    }                                                                                              \
    boost::shared_ptr<QString> Class::getChildMoniker()                                            \
    {                                                                                              \
        return mChildMoniker;                                                                      \
    }

ZEL_DEFINE_CHILD_EVENT(Zel_EventChildAdded, 1)
ZEL_DEFINE_CHILD_EVENT(Zel_EventChildRemoved, 2)
ZEL_DEFINE_CHILD_EVENT(Zel_EventChildUpdated, 4)
