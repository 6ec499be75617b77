// Test support for the result tests: a call log that names the objects handed
// to handlers and can make a handler throw, recording implementations of the
// callbacks that results of the library call, and a member-order probe.
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
#include "Zel_MobDesc.h"
#include "Zel_MobID.h"
#include "Zel_Node.h"
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

#include <pthread.h>

#include <algorithm>
#include <cstdint>
#include <map>
#include <set>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

namespace ResultsTest {

using Calls = std::vector<std::string>;
using ErrorSP = boost::shared_ptr<Zel_Error>;
using MobIDSP = boost::shared_ptr<Zel_MobID>;
using NodeSP = boost::shared_ptr<Zel_Node>;
using TextSP = boost::shared_ptr<QString>;

// The calls that reached the handlers, as "handler(arg,...)", in order. Objects
// made or registered here appear under their name; any other object as
// "anon", an empty pointer as "null".
class CallLog
{
public:
    template <class T>
    boost::shared_ptr<T> named(boost::shared_ptr<T> object, const std::string& name)
    {
        mNames[object.get()] = name;
        return object;
    }
    NodeSP node(const std::string& name) { return named(boost::make_shared<Zel_Node>(QString::fromStdString(name)), name); }
    MobIDSP mob(const std::string& name) { return named(boost::make_shared<Zel_MobID>(QString::fromStdString(name)), name); }
    TextSP text(const std::string& name) { return named(boost::make_shared<QString>(QString::fromStdString(name)), name); }
    boost::shared_ptr<Zel_MobDesc> desc(const std::string& name)
    {
        return named(boost::make_shared<Zel_MobDesc>(QString::fromStdString(name), QString(), QString()), name);
    }
    // An error record (code 7 unless told).
    ErrorSP error(const std::string& name, int code = 7)
    {
        return named(boost::make_shared<Zel_Error>(code, QStringLiteral("failure")), name);
    }

    template <class T>
    std::string arg(const boost::shared_ptr<T>& object) const
    {
        if (!object)
            return "null";
        auto it = mNames.find(object.get());
        return it == mNames.end() ? std::string("anon") : it->second;
    }
    std::string arg(const QString& value) const { return value.toStdString(); }
    std::string arg(bool value) const { return value ? "true" : "false"; }
    std::string arg(long value) const { return std::to_string(value); }

    // Makes the handler call with this 1-based number throw: a std exception
    // or, with foreign, an int.
    void throwAt(std::size_t callNumber, bool foreign = false) { (foreign ? mThrowForeign : mThrowStd).insert(callNumber); }
    // Makes the handler call with this 1-based number end its thread
    // (pthread_exit), after recording the call.
    void exitThreadAt(std::size_t callNumber) { mExitThread.insert(callNumber); }

    template <class... Args>
    void call(const char* handler, const Args&... args)
    {
        std::string line = std::string(handler) + "(";
        bool first = true;
        ((line += (first ? "" : ",") + arg(args), first = false), ...);
        record(line + ")");
    }
    void record(std::string line)
    {
        calls.push_back(std::move(line));
        if (mThrowStd.count(calls.size()))
            throw std::runtime_error("handler failure");
        if (mThrowForeign.count(calls.size()))
            throw 42;
        if (mExitThread.count(calls.size()))
            pthread_exit(nullptr);
    }

    Calls calls;

private:
    std::map<const void*, std::string> mNames;
    std::set<std::size_t> mThrowStd;
    std::set<std::size_t> mThrowForeign;
    std::set<std::size_t> mExitThread;
};

// Calls deliverNext() until it answers false (at most 20 times); the answers, e.g. "TTF".
template <class Res>
std::string deliverAll(Res& result)
{
    std::string answers;
    for (int i = 0; i < 20; ++i) {
        const bool more = result.deliverNext();
        answers += more ? 'T' : 'F';
        if (!more)
            break;
    }
    return answers;
}

// One deliverNext() call on a thread of its own: "T" or "F" for its answer,
// "X" when a handler ended the thread inside the call.
template <class Res>
std::string deliverOnOwnThread(Res& result)
{
    struct Run {
        Res* result;
        std::string answer = "X";
    } run{&result};
    pthread_t thread;
    if (pthread_create(&thread, nullptr,
                       [](void* context) -> void* {
                           Run* r = static_cast<Run*>(context);
                           r->answer = r->result->deliverNext() ? "T" : "F";
                           return nullptr;
                       },
                       &run)
        != 0)
        return "no thread";
    pthread_join(thread, nullptr);
    return run.answer;
}

// A success record (code -1).
inline ErrorSP ok()
{
    return boost::make_shared<Zel_Error>();
}

// failed(error) and finished() of the common callback shape.
template <class Base>
class Recording : public Base
{
public:
    explicit Recording(CallLog& log) : mLog(log) {}
    void failed(ErrorSP error) override { mLog.call(__func__, error); }
    void finished() override { mLog.call(__func__); }

protected:
    CallLog& mLog;
};

// Callbacks whose succeeded receives one node, nothing, or one text.
template <class Base>
struct NodeCB : Recording<Base> {
    using Recording<Base>::Recording;
    void succeeded(NodeSP node) override { this->mLog.call(__func__, node); }
};
template <class Base>
struct VoidCB : Recording<Base> {
    using Recording<Base>::Recording;
    void succeeded() override { this->mLog.call(__func__); }
};
template <class Base>
struct TextCB : Recording<Base> {
    using Recording<Base>::Recording;
    void succeeded(QString value) override { this->mLog.call(__func__, value); }
};

struct ResultBoolCB : Recording<Zel_ResultBoolCB> {
    using Recording::Recording;
    void succeeded(bool deleted) override { mLog.call(__func__, deleted); }
};
struct AssociationsCB : Recording<Zel_AssociationsCB> {
    using Recording::Recording;
    void succeeded(boost::shared_ptr<Zel_Directory> directory) override { mLog.call(__func__, directory); }
};
struct GetReservationsCB : Recording<Zel_GetReservationsCB> {
    using Recording::Recording;
    void succeeded(QString value, QDateTime when) override { mLog.call(__func__, value, when.toString(Qt::ISODate)); }
};
struct GetUserSettingsCB : Recording<Zel_GetUserSettingsCB> {
    using Recording::Recording;
    void succeeded(UserSettingsType type, QString value) override { mLog.call(__func__, long(type), value); }
};
struct NodePermissionsCB : Recording<Zel_NodePermissionsCB> {
    using Recording::Recording;
    void succeeded(boost::shared_ptr<Zel_NodePermissions> permissions) override { mLog.call(__func__, permissions); }
};
struct NodeResolutionsCB : Recording<Zel_NodeResolutionsCB> {
    using Recording::Recording;
    void succeeded(MobIDSP mobID, TextSP value) override { mLog.call(__func__, mobID, value); }
};

struct ChildrenCB : Zel_ChildrenCB {
    explicit ChildrenCB(CallLog& log) : mLog(log) {}
    void succeeded(NodeSP node, bool value) override { mLog.call(__func__, node, value); }
    void succeeded(NodeSP first, NodeSP second) override { mLog.call(__func__, first, second); }
    void failed(NodeSP node, ErrorSP error) override { mLog.call(__func__, node, error); }
    void finished() override { mLog.call(__func__); }
    CallLog& mLog;
};

struct CheckinCB : Zel_CheckinCB {
    explicit CheckinCB(CallLog& log) : mLog(log) {}
    void succeeded(boost::shared_ptr<Zel_MobDesc> desc, NodeSP node, TextSP text) override
    {
        mLog.call(__func__, desc, node, text);
    }
    void failed(boost::shared_ptr<Zel_MobDesc> desc, ErrorSP error) override { mLog.call(__func__, desc, error); }
    void finished() override { mLog.call(__func__); }
    CallLog& mLog;
};

struct StartupCB : Zel_StartupCB {
    explicit StartupCB(CallLog& log) : mLog(log) {}
    void succeeded() override { mLog.call(__func__); }
    void failed(ErrorSP error) override { mLog.call(__func__, error); }
    CallLog& mLog;
};

struct DeleteCB : Zel_DeleteCB {
    explicit DeleteCB(CallLog& log) : mLog(log) {}
    void remoteAssetDeleteSuccessTotalResult(long count) override { mLog.call(__func__, count); }
    void remoteMetadataDeleteSuccessTotalResult(long count) override { mLog.call(__func__, count); }
    void remoteMetadataDeleteErrorPartialResult(MobIDSP mob, ErrorSP error) override { mLog.call(__func__, mob, error); }
    void remoteMediaDeleteSuccessPartialResult(MobIDSP mob) override { mLog.call(__func__, mob); }
    void remoteMediaDeleteErrorPartialResult(TextSP t1, TextSP t2, TextSP t3, TextSP t4, TextSP t5, ErrorSP error) override
    {
        mLog.call(__func__, t1, t2, t3, t4, t5, error);
    }
    void localDeleteMediaSuccessPartialResult(MobIDSP mob) override { mLog.call(__func__, mob); }
    void localDeleteMediaErrorPartialResult(TextSP t1, TextSP t2, TextSP t3, TextSP t4, ErrorSP error) override
    {
        mLog.call(__func__, t1, t2, t3, t4, error);
    }
    void localDeleteMobNotFoundErrorPartialResult(MobIDSP mob, ErrorSP error) override { mLog.call(__func__, mob, error); }
    void errorResult(ErrorSP error) override { mLog.call(__func__, error); }
    void finished() override { mLog.call(__func__); }
    CallLog& mLog;
};

// The given members of one object in address order, as "a<b<c".
inline std::string memberOrder(std::vector<std::pair<const void*, std::string>> members)
{
    std::sort(members.begin(), members.end(), [](const auto& a, const auto& b) {
        return reinterpret_cast<std::uintptr_t>(a.first) < reinterpret_cast<std::uintptr_t>(b.first);
    });
    std::string order;
    for (const auto& member : members)
        order += (order.empty() ? "" : "<") + member.second;
    return order;
}

// A result of the generic shape whose field order can be read.
template <class Res>
struct Layout : Res {
    using Res::Res;
    std::string order() const
    {
        return memberOrder({{&this->mItems, "items"}, {&this->mCursor, "cursor"}, {&this->mCallback, "callback"}});
    }
};

} // namespace ResultsTest

#endif
