// Every request class of the catalogue: its name, its base, its copy rules.
#include "zel_request_headers.h"

#include "Orv_ResultQ.h"
#include "Orv_ResultsCB.h"
#include "Zel_Res.h"

#include <boost/make_shared.hpp>
#include <gtest/gtest.h>

#include <type_traits>
#include <utility>
#include <vector>

namespace {

struct AnyCB : Orv_ResultsCB {
    AnyCB() : Orv_ResultsCB(Orv_RequestID(Orv_RequestID::Callback)) {}
};

// A backend-style request: derives from the catalogue class and supplies the work.
template <class Request>
struct Concrete : Request {
    explicit Concrete(boost::shared_ptr<Orv_ResultsCB> cb) : Request(cb) {}
    bool doProcess(boost::shared_ptr<Orv_Result>&) override { return true; }
    boost::shared_ptr<Orv_ResultQ> queue() const { return this->getORVResultQ(); }
};

template <class Request>
struct ConcreteEngine : Request {
    explicit ConcreteEngine(boost::shared_ptr<Orv_ResultsCB> cb) : Request(cb) {}
    bool process(boost::shared_ptr<Orv_ResultQ>) override { return true; }
};

template <class Request>
void expectZelRequest(const char* literal)
{
    static_assert(std::is_base_of<Zel_Req, Request>::value, "on Zel_Req");
    static_assert(std::is_abstract<Request>::value, "work left to the backend");
    static_assert(!std::is_copy_assignable<Request>::value, "no copy assignment");
    static_assert(std::has_virtual_destructor<Request>::value, "virtual destructor");
    static_assert(sizeof(Request) == sizeof(Zel_Req), "adds no field");

    const boost::shared_ptr<Orv_ResultsCB> callback = boost::make_shared<AnyCB>();
    Concrete<Request> request(callback);
    EXPECT_EQ(request.getName(), QString::fromLatin1(literal));
    EXPECT_EQ(request.name(), literal);
    EXPECT_EQ(request.getCallback(), callback);

    const boost::shared_ptr<Orv_ResultQ> queue = boost::make_shared<Orv_ResultQ>();
    EXPECT_TRUE(request.process(queue));
    const Concrete<Request> copy(request);
    EXPECT_EQ(copy.getName(), QString::fromLatin1(literal));
    EXPECT_EQ(copy.getCallback(), callback);
    EXPECT_EQ(copy.queue(), queue);
    EXPECT_EQ(copy.getRequestID(), request.getRequestID());

    const Concrete<Request> withoutCallback((boost::shared_ptr<Orv_ResultsCB>()));
    EXPECT_FALSE(withoutCallback.getCallback());
}

template <class Request>
void expectEngineRequest(const char* literal)
{
    static_assert(std::is_base_of<Orv_Request, Request>::value, "on Orv_Request");
    static_assert(!std::is_base_of<Zel_Req, Request>::value, "not on Zel_Req");
    static_assert(std::is_abstract<Request>::value, "process left to the backend");
    static_assert(!std::is_copy_assignable<Request>::value, "no copy assignment");
    static_assert(sizeof(Request) == sizeof(Orv_Request), "adds no field");

    const boost::shared_ptr<Orv_ResultsCB> callback = boost::make_shared<AnyCB>();
    const ConcreteEngine<Request> request(callback);
    EXPECT_EQ(request.name(), literal);
    EXPECT_EQ(request.getCallback(), callback);
    const ConcreteEngine<Request> copy(request);
    EXPECT_EQ(copy.name(), literal);
    EXPECT_EQ(copy.getCallback(), callback);
}

} // namespace

TEST(Zel_RequestCatalogueTest, EveryRequestCarriesItsNameCallbackAndQueue)
{
    // Each request is named after its class, except the query request.
#define ZEL_REQ(Class) {#Class, &expectZelRequest<Class>}
    const std::vector<std::pair<const char*, void (*)(const char*)>> requests = {
        ZEL_REQ(Zel_AddDependencyReq), ZEL_REQ(Zel_AddFrameLocatorListReq), ZEL_REQ(Zel_AddFrameRestrictionListReq),
        ZEL_REQ(Zel_AnalyzeReq), ZEL_REQ(Zel_AssociationsReq), ZEL_REQ(Zel_CheckinLocalBinReq),
        ZEL_REQ(Zel_CheckinReq), ZEL_REQ(Zel_CheckinUpdateReq), ZEL_REQ(Zel_ChildrenAtMonikerReq),
        ZEL_REQ(Zel_ChildrenAtReq), ZEL_REQ(Zel_ChildrenReq), ZEL_REQ(Zel_CopyNodeReq),
        ZEL_REQ(Zel_CreateFolderReq), ZEL_REQ(Zel_CreateFolderUniqueReq), ZEL_REQ(Zel_CreateNodeUniqueReq),
        ZEL_REQ(Zel_CreatePropertyReq), ZEL_REQ(Zel_CreateReservationReq), ZEL_REQ(Zel_DeleteFrameLocatorListReq),
        ZEL_REQ(Zel_DeleteFrameRestrictionListReq), ZEL_REQ(Zel_DeleteNodeReq), ZEL_REQ(Zel_DeleteReq),
        ZEL_REQ(Zel_DirReq), ZEL_REQ(Zel_GetApplicationSettingsReq), ZEL_REQ(Zel_GetChildrenReq),
        ZEL_REQ(Zel_GetFrameLocatorListReq), ZEL_REQ(Zel_GetFrameRestrictionListReq),
        ZEL_REQ(Zel_GetLinkedProjectsReq), ZEL_REQ(Zel_GetNodeReq), ZEL_REQ(Zel_GetReservationsReq),
        ZEL_REQ(Zel_GetSettingsReq), ZEL_REQ(Zel_GetSyncedProjRootReq), ZEL_REQ(Zel_GetUserPriviledgesReq),
        ZEL_REQ(Zel_GetUserSettingsReq), ZEL_REQ(Zel_GetWorkgroupSettingsReq), ZEL_REQ(Zel_MediaResolutionsReq),
        ZEL_REQ(Zel_MobBinaryDnDReq), ZEL_REQ(Zel_MobBinaryReq), ZEL_REQ(Zel_MobHeadframeReq),
        ZEL_REQ(Zel_MobNodeReq), ZEL_REQ(Zel_MonikerReq), ZEL_REQ(Zel_MoveNodeReq), ZEL_REQ(Zel_NodePermissionsReq),
        ZEL_REQ(Zel_NodeReq), ZEL_REQ(Zel_NodeResolutionsReq), ZEL_REQ(Zel_PropertyListReq),
        {"Zel_Query", &expectZelRequest<Zel_QueryReq>}, ZEL_REQ(Zel_RefreshNodeReq),
        ZEL_REQ(Zel_RemoveReservationReq), ZEL_REQ(Zel_RenameNodeReq), ZEL_REQ(Zel_RenameUniqueReq),
        ZEL_REQ(Zel_SaveSettingsReq), ZEL_REQ(Zel_SetApplicationSettingsReq), ZEL_REQ(Zel_SetPropertiesReq),
        ZEL_REQ(Zel_SetUserSettingsReq), ZEL_REQ(Zel_StartupReq)
    };
#undef ZEL_REQ
    ASSERT_EQ(requests.size(), 55u);
    for (const auto& request : requests) {
        SCOPED_TRACE(request.first);
        request.second(request.first);
    }
    expectEngineRequest<Zel_GetPropertiesReq>("Zel_GetPropertiesReq");
    expectEngineRequest<Zel_LoginReq>("Zel_LoginReq");
    expectEngineRequest<Zel_RootNodeReq>("Zel_RootNodeReq");
}
