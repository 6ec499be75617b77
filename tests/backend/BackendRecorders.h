// Test support for the in-memory backend: callbacks that record what they
// receive, a folder listener that records its events, and a fixture with an
// engine, the sample tree and a logged-in session.
#ifndef ZEL_TESTS_BACKENDRECORDERS_H
#define ZEL_TESTS_BACKENDRECORDERS_H

#include "Orv_Engine.h"
#include "Zel_MemoryError.h"
#include "Zel_MemoryErrorCodes.h"
#include "Zel_MemorySession.h"
#include "Zel_MemoryTree.h"
#include "StoreUnderTest.h"

// Every request class: submitting one needs its complete type.
#include "zel_request_headers.h"

#include "Zel_AnalyzeCB.h"
#include "Zel_AssociationsCB.h"
#include "Zel_CheckinCB.h"
#include "Zel_CheckinUpdateCB.h"
#include "Zel_ChildrenAtCB.h"
#include "Zel_ChildrenAtMonikerCB.h"
#include "Zel_ChildrenCB.h"
#include "Zel_ConditionalSetPropertiesCB.h"
#include "Zel_CopyNodeCB.h"
#include "Zel_CreateFolderCB.h"
#include "Zel_CreateFolderUniqueCB.h"
#include "Zel_CreatePropertyCB.h"
#include "Zel_CreateReservationCB.h"
#include "Zel_DeleteCB.h"
#include "Zel_Dependency.h"
#include "Zel_DependencyCB.h"
#include "Zel_DirCB.h"
#include "Zel_Directory.h"
#include "Zel_Error.h"
#include "Zel_FrameLocator.h"
#include "Zel_FrameLocatorListCB.h"
#include "Zel_FrameRestrictionListCB.h"
#include "Zel_GetApplicationSettingsCB.h"
#include "Zel_GetReservationsCB.h"
#include "Zel_GetSettingsCB.h"
#include "Zel_GetUserSettingsCB.h"
#include "Zel_IEventListenerFolder.h"
#include "Zel_LoginCB.h"
#include "Zel_MediaResolutionsCB.h"
#include "Zel_MobBinaryCB.h"
#include "Zel_MobBinaryDnDCB.h"
#include "Zel_MobDesc.h"
#include "Zel_MobDescList.h"
#include "Zel_MobHeadframeCB.h"
#include "Zel_MobID.h"
#include "Zel_MobIDList.h"
#include "Zel_MobNodeCB.h"
#include "Zel_MonikerCB.h"
#include "Zel_MoveNodeCB.h"
#include "Zel_Node.h"
#include "Zel_NodeCB.h"
#include "Zel_NodePermissions.h"
#include "Zel_NodePermissionsCB.h"
#include "Zel_NodeResolutionsCB.h"
#include "Zel_Property.h"
#include "Zel_PropertyKeyInfoList.h"
#include "Zel_PropertyList.h"
#include "Zel_PropertyListCB.h"
#include "Zel_QueryCB.h"
#include "Zel_QuerySpec.h"
#include "Zel_RefreshNodeCB.h"
#include "Zel_RemoveReservationCB.h"
#include "Zel_RenameNodeCB.h"
#include "Zel_RenameUniqueCB.h"
#include "Zel_ResultBoolCB.h"
#include "Zel_ResultCB.h"
#include "Zel_RootNodeCB.h"
#include "Zel_SaveSettingsCB.h"
#include "Zel_SetApplicationSettingsCB.h"
#include "Zel_SetPropertiesCB.h"
#include "Zel_SetUserSettingsCB.h"
#include "Zel_SettingsCB.h"
#include "Zel_StartupCB.h"
#include "Zel_StatusNotificationCB.h"

#include <QByteArray>
#include <QString>
#include <QStringList>
#include <boost/shared_ptr.hpp>

#include <gtest/gtest.h>

#include <memory>

#include <mutex>

typedef boost::shared_ptr<QString> MonikerSP;
typedef boost::shared_ptr<Zel_Node> NodeSP;
typedef boost::shared_ptr<Zel_Error> ErrorSP;

inline MonikerSP mk(const QString& text)
{
    return MonikerSP(new QString(text));
}

// What a callback received, in order: "ok <payload>", "fail <code>", "finished".
struct Record {
    QStringList log;
    QList<int> codes;
    QStringList messages;
    QList<NodeSP> nodes;
    int ok = 0;
    int ends = 0;
    bool privilege = false;

    void succeeded(const QString& text)
    {
        ++ok;
        log << QStringLiteral("ok ") + text;
    }
    void succeededNode(const NodeSP& node)
    {
        nodes << node;
        succeeded(node ? node->getName() : QStringLiteral("<null>"));
    }
    void failedWith(const ErrorSP& error)
    {
        codes << (error ? error->getCode() : -1);
        messages << (error ? error->getMsg() : QString());
        privilege = privilege || (error && error->isPrivilegeError());
        log << QStringLiteral("fail %1").arg(error ? error->getCode() : -1);
    }
    void finish()
    {
        ++ends;
        log << QStringLiteral("finished");
    }
    int answers() const { return ok + codes.size(); }
};

#define ZEL_TEST_FAILED_FINISHED                                                                                       \
    void failed(ErrorSP error) override { failedWith(error); }                                                       \
    void finished() override { finish(); }

struct NodeRec : Zel_ResultCB, Record {
    void succeeded(NodeSP node) override { succeededNode(node); }
    ZEL_TEST_FAILED_FINISHED
};
struct BoolRec : Zel_ResultBoolCB, Record {
    void succeeded(bool value) override { Record::succeeded(value ? QStringLiteral("true") : QStringLiteral("false")); }
    ZEL_TEST_FAILED_FINISHED
};
#define ZEL_TEST_NODE_REC(Name, Base)                                                                                  \
    struct Name : Base, Record {                                                                                     \
        void succeeded(NodeSP node) override { succeededNode(node); }                                                \
        ZEL_TEST_FAILED_FINISHED                                                                                     \
    };
ZEL_TEST_NODE_REC(ChildrenAtRec, Zel_ChildrenAtCB)
ZEL_TEST_NODE_REC(CreateFolderRec, Zel_CreateFolderCB)
ZEL_TEST_NODE_REC(CreateFolderUniqueRec, Zel_CreateFolderUniqueCB)
ZEL_TEST_NODE_REC(MobNodeRec, Zel_MobNodeCB)
ZEL_TEST_NODE_REC(MoveNodeRec, Zel_MoveNodeCB)
ZEL_TEST_NODE_REC(NodeCBRec, Zel_NodeCB)
ZEL_TEST_NODE_REC(QueryRec, Zel_QueryCB)
ZEL_TEST_NODE_REC(RefreshNodeRec, Zel_RefreshNodeCB)
ZEL_TEST_NODE_REC(RenameNodeRec, Zel_RenameNodeCB)
ZEL_TEST_NODE_REC(RenameUniqueRec, Zel_RenameUniqueCB)
ZEL_TEST_NODE_REC(SetPropertiesRec, Zel_SetPropertiesCB)

struct ChildrenAtMonikerRec : Zel_ChildrenAtMonikerCB, Record {
    void succeeded(NodeSP node) override { succeededNode(node); }
    ZEL_TEST_FAILED_FINISHED
};
struct RootNodeRec : Zel_RootNodeCB, Record {
    void succeeded(NodeSP node) override { succeededNode(node); }
    void failed(ErrorSP error) override { failedWith(error); }
};
struct LoginRec : Zel_LoginCB, Record {
    void succeeded(QString user) override { Record::succeeded(user); }
    void failed(ErrorSP error) override { failedWith(error); }
};
#define ZEL_TEST_VOID_REC(Name, Base)                                                                                  \
    struct Name : Base, Record {                                                                                     \
        void succeeded() override { Record::succeeded(QString()); }                                                  \
        ZEL_TEST_FAILED_FINISHED                                                                                     \
    };
ZEL_TEST_VOID_REC(CreateReservationRec, Zel_CreateReservationCB)
ZEL_TEST_VOID_REC(RemoveReservationRec, Zel_RemoveReservationCB)
ZEL_TEST_VOID_REC(SaveSettingsRec, Zel_SaveSettingsCB)
ZEL_TEST_VOID_REC(SetApplicationSettingsRec, Zel_SetApplicationSettingsCB)
ZEL_TEST_VOID_REC(SetUserSettingsRec, Zel_SetUserSettingsCB)
ZEL_TEST_VOID_REC(CheckinUpdateRec, Zel_CheckinUpdateCB)
struct StartupRec : Zel_StartupCB, Record {
    void succeeded() override { Record::succeeded(QString()); }
    void failed(ErrorSP error) override { failedWith(error); }
};
#define ZEL_TEST_TEXT_REC(Name, Base)                                                                                  \
    struct Name : Base, Record {                                                                                     \
        void succeeded(QString text) override { Record::succeeded(text); }                                           \
        ZEL_TEST_FAILED_FINISHED                                                                                     \
    };
ZEL_TEST_TEXT_REC(AppSettingsRec, Zel_GetApplicationSettingsCB)
ZEL_TEST_TEXT_REC(GetSettingsRec, Zel_GetSettingsCB)
ZEL_TEST_TEXT_REC(SettingsRec, Zel_SettingsCB)
struct UserSettingsRec : Zel_GetUserSettingsCB, Record {
    void succeeded(UserSettingsType type, QString text) override
    {
        Record::succeeded(QString::number(static_cast<int>(type)) + QLatin1Char(' ') + text);
    }
    ZEL_TEST_FAILED_FINISHED
};
struct ReservationsRec : Zel_GetReservationsCB, Record {
    void succeeded(QString user, QDateTime until) override
    {
        Record::succeeded(user + QLatin1Char(' ') + (until.isValid() ? until.toString(Qt::ISODate) : QStringLiteral("-")));
    }
    ZEL_TEST_FAILED_FINISHED
};
#define ZEL_TEST_DIR_REC(Name, Base)                                                                                   \
    struct Name : Base, Record {                                                                                     \
        void succeeded(boost::shared_ptr<Zel_Directory> dir) override                                                \
        {                                                                                                            \
            Record::succeeded(dir ? dir->toZelString(QStringLiteral("/")) : QStringLiteral("<null>"));               \
        }                                                                                                            \
        ZEL_TEST_FAILED_FINISHED                                                                                     \
    };
ZEL_TEST_DIR_REC(DirRec, Zel_DirCB)
ZEL_TEST_DIR_REC(AssociationsRec, Zel_AssociationsCB)
struct MonikerRec : Zel_MonikerCB, Record {
    void succeeded(MonikerSP moniker) override { Record::succeeded(moniker ? *moniker : QStringLiteral("<null>")); }
    ZEL_TEST_FAILED_FINISHED
};
struct ChildrenRec : Zel_ChildrenCB, Record {
    void succeeded(NodeSP node, bool flag) override
    {
        nodes << node;
        Record::succeeded(node->getName() + (flag ? QStringLiteral(" +") : QStringLiteral(" -")));
    }
    void succeeded(NodeSP first, NodeSP second) override { Record::succeeded(first->getName() + QLatin1Char('/') + second->getName()); }
    void failed(NodeSP, ErrorSP error) override { failedWith(error); }
    void finished() override { finish(); }
};
struct CopyRec : Zel_CopyNodeCB, Record {
    QList<unsigned long> progressCalls;
    void succeeded(NodeSP source, NodeSP copy) override
    {
        nodes << copy;
        Record::succeeded(source->getName() + QStringLiteral(" -> ") + copy->getName());
    }
    void progress(unsigned long copied, unsigned long total) override { progressCalls << copied << total; }
    ZEL_TEST_FAILED_FINISHED
};
struct PropertiesRec : Zel_PropertyListCB, Record {
    Zel_PropertyList last;
    void succeeded(Zel_PropertyList properties) override
    {
        last = properties;
        Record::succeeded(QString::number(properties.size()));
    }
    ZEL_TEST_FAILED_FINISHED
};
struct ConditionalRec : Zel_ConditionalSetPropertiesCB, Record {
    Zel_PropertyList current;
    void succeeded(NodeSP node) override { succeededNode(node); }
    void conditionFailed(NodeSP, Zel_PropertyList values) override
    {
        current = values;
        log << QStringLiteral("conditionFailed");
    }
    ZEL_TEST_FAILED_FINISHED
};
struct CreatePropertyRec : Zel_CreatePropertyCB, Record {
    void succeeded(Zel_PropertyKeyInfo info) override { Record::succeeded(info.toZelString()); }
    ZEL_TEST_FAILED_FINISHED
};
struct ResolutionsRec : Zel_MediaResolutionsCB, Record {
    void succeeded(Zel_PropertyKeyInfoList list) override { Record::succeeded(list.toZelString()); }
    ZEL_TEST_FAILED_FINISHED
};
struct NodeResolutionsRec : Zel_NodeResolutionsCB, Record {
    void succeeded(boost::shared_ptr<Zel_MobID> mob, MonikerSP text) override
    {
        Record::succeeded(mob->toZelString() + QLatin1Char(' ') + *text);
    }
    ZEL_TEST_FAILED_FINISHED
};
struct PermissionsRec : Zel_NodePermissionsCB, Record {
    void succeeded(boost::shared_ptr<Zel_NodePermissions> p) override { Record::succeeded(p->toZelString()); }
    ZEL_TEST_FAILED_FINISHED
};
#define ZEL_TEST_MARKER_REC(Name, Base)                                                                                \
    struct Name : Base, Record {                                                                                     \
        QList<Zel_FrameLocator> last;                                                                                \
        void succeeded(QList<Zel_FrameLocator> list) override                                                        \
        {                                                                                                            \
            last = list;                                                                                             \
            QStringList ids;                                                                                         \
            for (const Zel_FrameLocator& l : list)                                                                   \
                ids << l.getID();                                                                                    \
            Record::succeeded(ids.join(QLatin1Char(',')));                                                           \
        }                                                                                                            \
        ZEL_TEST_FAILED_FINISHED                                                                                     \
    };
ZEL_TEST_MARKER_REC(LocatorsRec, Zel_FrameLocatorListCB)
ZEL_TEST_MARKER_REC(RestrictionsRec, Zel_FrameRestrictionListCB)
struct AnalyzeRec : Zel_AnalyzeCB, Record {
    QList<boost::shared_ptr<Zel_MobDesc>> descs;
    void succeeded(boost::shared_ptr<Zel_MobDesc> desc) override
    {
        descs << desc;
        Record::succeeded(desc->getMobID());
    }
    ZEL_TEST_FAILED_FINISHED
};
struct CheckinRec : Zel_CheckinCB, Record {
    void succeeded(boost::shared_ptr<Zel_MobDesc>, NodeSP node, MonikerSP text) override
    {
        nodes << node;
        Record::succeeded(*text);
    }
    void failed(boost::shared_ptr<Zel_MobDesc>, ErrorSP error) override { failedWith(error); }
    void finished() override { finish(); }
};
#define ZEL_TEST_BINARY_REC(Name, Base)                                                                                \
    struct Name : Base, Record {                                                                                     \
        QByteArray last;                                                                                             \
        void succeeded(boost::shared_ptr<Zel_MobID> mob, QByteArray data) override                                   \
        {                                                                                                            \
            last = data;                                                                                             \
            Record::succeeded(mob->toZelString());                                                                   \
        }                                                                                                            \
        ZEL_TEST_FAILED_FINISHED                                                                                     \
    };
ZEL_TEST_BINARY_REC(MobBinaryRec, Zel_MobBinaryCB)
ZEL_TEST_BINARY_REC(MobBinaryDnDRec, Zel_MobBinaryDnDCB)
ZEL_TEST_BINARY_REC(HeadframeRec, Zel_MobHeadframeCB)
struct DependencyRec : Zel_DependencyCB, Record {
    int dependencies = 0;
    void succeeded(NodeSP node, Zel_DependencySPList list) override
    {
        dependencies = list.size();
        succeededNode(node);
    }
    ZEL_TEST_FAILED_FINISHED
};
struct DeleteRec : Zel_DeleteCB, Record {
    void remoteAssetDeleteSuccessTotalResult(long count) override { log << QStringLiteral("assets %1").arg(count); }
    void remoteMetadataDeleteSuccessTotalResult(long count) override { log << QStringLiteral("records %1").arg(count); }
    void remoteMetadataDeleteErrorPartialResult(boost::shared_ptr<Zel_MobID> mob, ErrorSP) override
    {
        log << QStringLiteral("metadata error ") + mob->toZelString();
    }
    void remoteMediaDeleteSuccessPartialResult(boost::shared_ptr<Zel_MobID> mob) override
    {
        log << QStringLiteral("remote media ") + mob->toZelString();
    }
    void remoteMediaDeleteErrorPartialResult(MonikerSP mob, MonikerSP, MonikerSP, MonikerSP, MonikerSP, ErrorSP error) override
    {
        codes << error->getCode();
        log << QStringLiteral("remote media error ") + *mob;
    }
    void localDeleteMediaSuccessPartialResult(boost::shared_ptr<Zel_MobID> mob) override
    {
        log << QStringLiteral("local media ") + mob->toZelString();
    }
    void localDeleteMediaErrorPartialResult(MonikerSP, MonikerSP, MonikerSP, MonikerSP, ErrorSP error) override
    {
        codes << error->getCode();
    }
    void localDeleteMobNotFoundErrorPartialResult(boost::shared_ptr<Zel_MobID> mob, ErrorSP) override
    {
        log << QStringLiteral("local not found ") + mob->toZelString();
    }
    void errorResult(ErrorSP error) override { failedWith(error); }
    void finished() override { finish(); }
};
struct StatusRec : Zel_StatusNotificationCB {
    QStringList log;
    void connected() override { log << QStringLiteral("connected"); }
    void disconnected() override { log << QStringLiteral("disconnected"); }
};

// A folder listener that records "added <child>", "removed <child>", "updated <child>".
class FolderRec : public Zel_IEventListenerFolder
{
public:
    FolderRec(const QString& moniker, boost::shared_ptr<Zel_Session> session)
        : Zel_IEventListenerFolder(mk(moniker), 7, session)
    {
    }
    ~FolderRec() override { unregisterEventListener(); }
    void childAdded(MonikerSP, MonikerSP child) override { add(QStringLiteral("added ") + *child); }
    void childRemoved(MonikerSP, MonikerSP child) override { add(QStringLiteral("removed ") + *child); }
    void childUpdated(MonikerSP, MonikerSP child) override { add(QStringLiteral("updated ") + *child); }
    QStringList events() const
    {
        std::lock_guard<std::mutex> lock(mMutex);
        return mEvents;
    }

private:
    void add(const QString& text)
    {
        std::lock_guard<std::mutex> lock(mMutex);
        mEvents << text;
    }
    mutable std::mutex mMutex;
    QStringList mEvents;
};

template <class T>
boost::shared_ptr<T> rec()
{
    return boost::shared_ptr<T>(new T);
}

// Monikers of the sample tree.
namespace Sample {
inline QString m(const char* id)
{
    return QStringLiteral("zel-mem://") + QLatin1String(id);
}
const char* const Root = "ROOT";
const char* const News = "P-NEWS";
const char* const Footage = "B-FOOTAGE";
const char* const Sequences = "B-SEQUENCES";
const char* const Archive = "B-ARCHIVE";
const char* const Mayor = "C-MAYOR";
const char* const CityHall = "C-CITYHALL";
const char* const Bulletin = "Q-BULLETIN";
const char* const Highlights = "B-HIGHLIGHTS";
const char* const MayorMob = "060a2b340101010101010f00.13000000.0001";
} // namespace Sample

// An engine, a store of the kind under test holding the sample tree, and one
// session on it, logged in as the given user.
class BackendFixture : public ::testing::TestWithParam<StoreKind>
{
protected:
    void SetUp() override
    {
        store = load(Zel_MemoryTree::sampleJson());
        ASSERT_TRUE(store);
        session = newSession();
    }
    void TearDown() override
    {
        engine.DeliverAll();
        session.reset();
    }

    // A fresh store of the kind under test holding the tree of the JSON text.
    std::unique_ptr<StoreUnderTest> load(const QByteArray& json)
    {
        QString error;
        std::unique_ptr<StoreUnderTest> loaded = GetParam().load(json, &error);
        EXPECT_TRUE(loaded) << error.toStdString();
        return loaded;
    }

    boost::shared_ptr<Zel_MemorySession> newSession(const QString& user = QStringLiteral("editor"))
    {
        boost::shared_ptr<Zel_MemorySession> s = store->newSession(&engine, QStringLiteral("zel-demo"));
        if (!user.isEmpty()) {
            auto login = rec<LoginRec>();
            s->submitRequest(s->makeLoginReqSP(user, user, boost::shared_ptr<Zel_LoginCredentials>(), login));
            engine.DeliverAll();
            EXPECT_EQ(QStringList{QStringLiteral("ok ") + user}, login->log);
        }
        return s;
    }

    // Submits the request through the session and delivers every answer.
    template <class Req>
    void run(const boost::shared_ptr<Req>& request, const boost::shared_ptr<Zel_MemorySession>& through = {})
    {
        ASSERT_TRUE(request);
        ASSERT_TRUE((through ? through : session)->submitRequest(request));
        engine.DeliverAll();
    }

    Orv_Engine engine{2};
    std::unique_ptr<StoreUnderTest> store;
    boost::shared_ptr<Zel_MemorySession> session;
};

#endif
