// Test support for the result and callback catalogue tests: a call log that
// names the objects handed to handlers and can make a handler throw, and
// recording implementations of the callbacks that results of the library call.
#ifndef ZEL_TESTS_RESULTSTESTSUPPORT_H
#define ZEL_TESTS_RESULTSTESTSUPPORT_H

#include "Zel_AssociationsCB.h"
#include "Zel_CheckinCB.h"
#include "Zel_CheckinUpdateCB.h"
#include "Zel_ChildrenCB.h"
#include "Zel_CreateFolderUniqueCB.h"
#include "Zel_CreateReservationCB.h"
#include "Zel_DeleteCB.h"
#include "Zel_DependencyCB.h"
#include "Zel_Error.h"
#include "Zel_GetApplicationSettingsCB.h"
#include "Zel_GetReservationsCB.h"
#include "Zel_GetUserSettingsCB.h"
#include "Zel_MediaResolutionsCB.h"
#include "Zel_NodePermissionsCB.h"
#include "Zel_NodeResolutionsCB.h"
#include "Zel_RemoveReservationCB.h"
#include "Zel_RenameUniqueCB.h"
#include "Zel_ResultBoolCB.h"
#include "Zel_ResultCB.h"
#include "Zel_SetApplicationSettingsCB.h"
#include "Zel_SetUserSettingsCB.h"
#include "Zel_SettingsCB.h"
#include "Zel_StartupCB.h"

#include <QDateTime>
#include <QString>
#include <boost/make_shared.hpp>
#include <boost/shared_ptr.hpp>

#include <map>
#include <set>
#include <stdexcept>
#include <string>
#include <vector>

namespace ResultsTest {

using Calls = std::vector<std::string>;

// The calls that reached the handlers, as text, in order. Objects registered
// with named() appear under their name; an unregistered object as "anon", an
// empty pointer as "null".
class CallLog
{
public:
    template <class T>
    boost::shared_ptr<T> named(boost::shared_ptr<T> object, const std::string& name)
    {
        mNames[object.get()] = name;
        return object;
    }

    template <class T>
    std::string name(const boost::shared_ptr<T>& object) const
    {
        if (!object)
            return "null";
        auto it = mNames.find(object.get());
        return it == mNames.end() ? std::string("anon") : it->second;
    }

    // Makes the handler call with this 1-based number throw: a std exception
    // or, with foreign, an int.
    void throwAt(std::size_t callNumber, bool foreign = false)
    {
        (foreign ? mThrowForeign : mThrowStd).insert(callNumber);
    }

    void record(std::string call)
    {
        calls.push_back(std::move(call));
        if (mThrowStd.count(calls.size()))
            throw std::runtime_error("handler failure");
        if (mThrowForeign.count(calls.size()))
            throw 42;
    }

    Calls calls;

private:
    std::map<const void*, std::string> mNames;
    std::set<std::size_t> mThrowStd;
    std::set<std::size_t> mThrowForeign;
};

inline std::string text(const QString& value)
{
    return value.toStdString();
}

inline std::string flag(bool value)
{
    return value ? "true" : "false";
}

// failed(error) and finished() of the common callback shape.
template <class Base>
class Recording : public Base
{
public:
    explicit Recording(CallLog& log) : mLog(log) {}
    void failed(boost::shared_ptr<Zel_Error> error) override { mLog.record("failed(" + mLog.name(error) + ")"); }
    void finished() override { mLog.record("finished()"); }

protected:
    CallLog& mLog;
};

// Callbacks whose succeeded receives one node.
template <class Base>
class NodeCB : public Recording<Base>
{
public:
    using Recording<Base>::Recording;
    void succeeded(boost::shared_ptr<Zel_Node> node) override
    {
        this->mLog.record("succeeded(" + this->mLog.name(node) + ")");
    }
};

// Callbacks whose succeeded receives nothing.
template <class Base>
class VoidCB : public Recording<Base>
{
public:
    using Recording<Base>::Recording;
    void succeeded() override { this->mLog.record("succeeded()"); }
};

// Callbacks whose succeeded receives one text.
template <class Base>
class TextCB : public Recording<Base>
{
public:
    using Recording<Base>::Recording;
    void succeeded(QString value) override { this->mLog.record("succeeded(" + text(value) + ")"); }
};

class ResultBoolCB : public Recording<Zel_ResultBoolCB>
{
public:
    using Recording::Recording;
    void succeeded(bool deleted) override { mLog.record("succeeded(" + flag(deleted) + ")"); }
};

class AssociationsCB : public Recording<Zel_AssociationsCB>
{
public:
    using Recording::Recording;
    void succeeded(boost::shared_ptr<Zel_Directory> directory) override
    {
        mLog.record("succeeded(" + mLog.name(directory) + ")");
    }
};

class GetReservationsCB : public Recording<Zel_GetReservationsCB>
{
public:
    using Recording::Recording;
    void succeeded(QString value, QDateTime dateTime) override
    {
        mLog.record("succeeded(" + text(value) + "," + text(dateTime.toString(Qt::ISODate)) + ")");
    }
};

class GetUserSettingsCB : public Recording<Zel_GetUserSettingsCB>
{
public:
    using Recording::Recording;
    void succeeded(UserSettingsType type, QString value) override
    {
        mLog.record("succeeded(" + std::to_string(static_cast<long long>(type)) + "," + text(value) + ")");
    }
};

class NodePermissionsCB : public Recording<Zel_NodePermissionsCB>
{
public:
    using Recording::Recording;
    void succeeded(boost::shared_ptr<Zel_NodePermissions> permissions) override
    {
        mLog.record("succeeded(" + mLog.name(permissions) + ")");
    }
};

class NodeResolutionsCB : public Recording<Zel_NodeResolutionsCB>
{
public:
    using Recording::Recording;
    void succeeded(boost::shared_ptr<Zel_MobID> mobID, boost::shared_ptr<QString> value) override
    {
        mLog.record("succeeded(" + mLog.name(mobID) + "," + mLog.name(value) + ")");
    }
};

class ChildrenCB : public Zel_ChildrenCB
{
public:
    explicit ChildrenCB(CallLog& log) : mLog(log) {}
    void succeeded(boost::shared_ptr<Zel_Node> node, bool value) override
    {
        mLog.record("succeeded(" + mLog.name(node) + "," + flag(value) + ")");
    }
    void succeeded(boost::shared_ptr<Zel_Node> first, boost::shared_ptr<Zel_Node> second) override
    {
        mLog.record("succeeded(" + mLog.name(first) + "," + mLog.name(second) + ")");
    }
    void failed(boost::shared_ptr<Zel_Node> node, boost::shared_ptr<Zel_Error> error) override
    {
        mLog.record("failed(" + mLog.name(node) + "," + mLog.name(error) + ")");
    }
    void finished() override { mLog.record("finished()"); }

private:
    CallLog& mLog;
};

class CheckinCB : public Zel_CheckinCB
{
public:
    explicit CheckinCB(CallLog& log) : mLog(log) {}
    void succeeded(boost::shared_ptr<Zel_MobDesc> mobDesc, boost::shared_ptr<Zel_Node> node,
                   boost::shared_ptr<QString> value) override
    {
        mLog.record("succeeded(" + mLog.name(mobDesc) + "," + mLog.name(node) + "," + mLog.name(value) + ")");
    }
    void failed(boost::shared_ptr<Zel_MobDesc> mobDesc, boost::shared_ptr<Zel_Error> error) override
    {
        mLog.record("failed(" + mLog.name(mobDesc) + "," + mLog.name(error) + ")");
    }
    void finished() override { mLog.record("finished()"); }

private:
    CallLog& mLog;
};

class StartupCB : public Zel_StartupCB
{
public:
    explicit StartupCB(CallLog& log) : mLog(log) {}
    void succeeded() override { mLog.record("succeeded()"); }
    void failed(boost::shared_ptr<Zel_Error> error) override { mLog.record("failed(" + mLog.name(error) + ")"); }

private:
    CallLog& mLog;
};

class DeleteCB : public Zel_DeleteCB
{
public:
    explicit DeleteCB(CallLog& log) : mLog(log) {}
    void remoteAssetDeleteSuccessTotalResult(long count) override
    {
        mLog.record("remoteAssetDeleteSuccessTotalResult(" + std::to_string(count) + ")");
    }
    void remoteMetadataDeleteSuccessTotalResult(long count) override
    {
        mLog.record("remoteMetadataDeleteSuccessTotalResult(" + std::to_string(count) + ")");
    }
    void remoteMetadataDeleteErrorPartialResult(boost::shared_ptr<Zel_MobID> mobID,
                                                boost::shared_ptr<Zel_Error> error) override
    {
        mLog.record("remoteMetadataDeleteErrorPartialResult(" + mLog.name(mobID) + "," + mLog.name(error) + ")");
    }
    void remoteMediaDeleteSuccessPartialResult(boost::shared_ptr<Zel_MobID> mobID) override
    {
        mLog.record("remoteMediaDeleteSuccessPartialResult(" + mLog.name(mobID) + ")");
    }
    void remoteMediaDeleteErrorPartialResult(boost::shared_ptr<QString> t1, boost::shared_ptr<QString> t2,
                                             boost::shared_ptr<QString> t3, boost::shared_ptr<QString> t4,
                                             boost::shared_ptr<QString> t5, boost::shared_ptr<Zel_Error> error) override
    {
        mLog.record("remoteMediaDeleteErrorPartialResult(" + mLog.name(t1) + "," + mLog.name(t2) + "," +
                    mLog.name(t3) + "," + mLog.name(t4) + "," + mLog.name(t5) + "," + mLog.name(error) + ")");
    }
    void localDeleteMediaSuccessPartialResult(boost::shared_ptr<Zel_MobID> mobID) override
    {
        mLog.record("localDeleteMediaSuccessPartialResult(" + mLog.name(mobID) + ")");
    }
    void localDeleteMediaErrorPartialResult(boost::shared_ptr<QString> t1, boost::shared_ptr<QString> t2,
                                            boost::shared_ptr<QString> t3, boost::shared_ptr<QString> t4,
                                            boost::shared_ptr<Zel_Error> error) override
    {
        mLog.record("localDeleteMediaErrorPartialResult(" + mLog.name(t1) + "," + mLog.name(t2) + "," +
                    mLog.name(t3) + "," + mLog.name(t4) + "," + mLog.name(error) + ")");
    }
    void localDeleteMobNotFoundErrorPartialResult(boost::shared_ptr<Zel_MobID> mobID,
                                                  boost::shared_ptr<Zel_Error> error) override
    {
        mLog.record("localDeleteMobNotFoundErrorPartialResult(" + mLog.name(mobID) + "," + mLog.name(error) + ")");
    }
    void errorResult(boost::shared_ptr<Zel_Error> error) override
    {
        mLog.record("errorResult(" + mLog.name(error) + ")");
    }
    void finished() override { mLog.record("finished()"); }

private:
    CallLog& mLog;
};

// A success record (code -1) and an error record, registered under a name.
inline boost::shared_ptr<Zel_Error> success(CallLog& log, const std::string& name)
{
    return log.named(boost::make_shared<Zel_Error>(), name);
}

inline boost::shared_ptr<Zel_Error> failure(CallLog& log, const std::string& name, int code = 7)
{
    return log.named(boost::make_shared<Zel_Error>(code, QStringLiteral("failure")), name);
}

} // namespace ResultsTest

#endif
