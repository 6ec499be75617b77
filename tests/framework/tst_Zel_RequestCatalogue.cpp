// Every request class of the catalogue: its name, its base, its copy rules.
#include "Zel_AddDependencyReq.h"
#include "Zel_AddFrameLocatorListReq.h"
#include "Zel_AddFrameRestrictionListReq.h"
#include "Zel_AnalyzeReq.h"
#include "Zel_AssociationsReq.h"
#include "Zel_CheckinLocalBinReq.h"
#include "Zel_CheckinReq.h"
#include "Zel_CheckinUpdateReq.h"
#include "Zel_ChildrenAtMonikerReq.h"
#include "Zel_ChildrenAtReq.h"
#include "Zel_ChildrenReq.h"
#include "Zel_CopyNodeReq.h"
#include "Zel_CreateFolderReq.h"
#include "Zel_CreateFolderUniqueReq.h"
#include "Zel_CreateNodeUniqueReq.h"
#include "Zel_CreatePropertyReq.h"
#include "Zel_CreateReservationReq.h"
#include "Zel_DeleteFrameLocatorListReq.h"
#include "Zel_DeleteFrameRestrictionListReq.h"
#include "Zel_DeleteNodeReq.h"
#include "Zel_DeleteReq.h"
#include "Zel_DirReq.h"
#include "Zel_GetApplicationSettingsReq.h"
#include "Zel_GetChildrenReq.h"
#include "Zel_GetFrameLocatorListReq.h"
#include "Zel_GetFrameRestrictionListReq.h"
#include "Zel_GetLinkedProjectsReq.h"
#include "Zel_GetNodeReq.h"
#include "Zel_GetPropertiesReq.h"
#include "Zel_GetReservationsReq.h"
#include "Zel_GetSettingsReq.h"
#include "Zel_GetSyncedProjRootReq.h"
#include "Zel_GetUserPriviledgesReq.h"
#include "Zel_GetUserSettingsReq.h"
#include "Zel_GetWorkgroupSettingsReq.h"
#include "Zel_LoginReq.h"
#include "Zel_MediaResolutionsReq.h"
#include "Zel_MobBinaryDnDReq.h"
#include "Zel_MobBinaryReq.h"
#include "Zel_MobHeadframeReq.h"
#include "Zel_MobNodeReq.h"
#include "Zel_MonikerReq.h"
#include "Zel_MoveNodeReq.h"
#include "Zel_NodePermissionsReq.h"
#include "Zel_NodeReq.h"
#include "Zel_NodeResolutionsReq.h"
#include "Zel_PropertyListReq.h"
#include "Zel_QueryReq.h"
#include "Zel_RefreshNodeReq.h"
#include "Zel_RemoveReservationReq.h"
#include "Zel_RenameNodeReq.h"
#include "Zel_RenameUniqueReq.h"
#include "Zel_RootNodeReq.h"
#include "Zel_SaveSettingsReq.h"
#include "Zel_SetApplicationSettingsReq.h"
#include "Zel_SetPropertiesReq.h"
#include "Zel_SetUserSettingsReq.h"
#include "Zel_StartupReq.h"

#include "Orv_ResultQ.h"
#include "Orv_ResultsCB.h"
#include "Zel_Res.h"

#include <boost/make_shared.hpp>
#include <gtest/gtest.h>

#include <type_traits>

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
    expectZelRequest<Zel_AddDependencyReq>("Zel_AddDependencyReq");
    expectZelRequest<Zel_AddFrameLocatorListReq>("Zel_AddFrameLocatorListReq");
    expectZelRequest<Zel_AddFrameRestrictionListReq>("Zel_AddFrameRestrictionListReq");
    expectZelRequest<Zel_AnalyzeReq>("Zel_AnalyzeReq");
    expectZelRequest<Zel_AssociationsReq>("Zel_AssociationsReq");
    expectZelRequest<Zel_CheckinLocalBinReq>("Zel_CheckinLocalBinReq");
    expectZelRequest<Zel_CheckinReq>("Zel_CheckinReq");
    expectZelRequest<Zel_CheckinUpdateReq>("Zel_CheckinUpdateReq");
    expectZelRequest<Zel_ChildrenAtMonikerReq>("Zel_ChildrenAtMonikerReq");
    expectZelRequest<Zel_ChildrenAtReq>("Zel_ChildrenAtReq");
    expectZelRequest<Zel_ChildrenReq>("Zel_ChildrenReq");
    expectZelRequest<Zel_CopyNodeReq>("Zel_CopyNodeReq");
    expectZelRequest<Zel_CreateFolderReq>("Zel_CreateFolderReq");
    expectZelRequest<Zel_CreateFolderUniqueReq>("Zel_CreateFolderUniqueReq");
    expectZelRequest<Zel_CreateNodeUniqueReq>("Zel_CreateNodeUniqueReq");
    expectZelRequest<Zel_CreatePropertyReq>("Zel_CreatePropertyReq");
    expectZelRequest<Zel_CreateReservationReq>("Zel_CreateReservationReq");
    expectZelRequest<Zel_DeleteFrameLocatorListReq>("Zel_DeleteFrameLocatorListReq");
    expectZelRequest<Zel_DeleteFrameRestrictionListReq>("Zel_DeleteFrameRestrictionListReq");
    expectZelRequest<Zel_DeleteNodeReq>("Zel_DeleteNodeReq");
    expectZelRequest<Zel_DeleteReq>("Zel_DeleteReq");
    expectZelRequest<Zel_DirReq>("Zel_DirReq");
    expectZelRequest<Zel_GetApplicationSettingsReq>("Zel_GetApplicationSettingsReq");
    expectZelRequest<Zel_GetChildrenReq>("Zel_GetChildrenReq");
    expectZelRequest<Zel_GetFrameLocatorListReq>("Zel_GetFrameLocatorListReq");
    expectZelRequest<Zel_GetFrameRestrictionListReq>("Zel_GetFrameRestrictionListReq");
    expectZelRequest<Zel_GetLinkedProjectsReq>("Zel_GetLinkedProjectsReq");
    expectZelRequest<Zel_GetNodeReq>("Zel_GetNodeReq");
    expectZelRequest<Zel_GetReservationsReq>("Zel_GetReservationsReq");
    expectZelRequest<Zel_GetSettingsReq>("Zel_GetSettingsReq");
    expectZelRequest<Zel_GetSyncedProjRootReq>("Zel_GetSyncedProjRootReq");
    expectZelRequest<Zel_GetUserPriviledgesReq>("Zel_GetUserPriviledgesReq");
    expectZelRequest<Zel_GetUserSettingsReq>("Zel_GetUserSettingsReq");
    expectZelRequest<Zel_GetWorkgroupSettingsReq>("Zel_GetWorkgroupSettingsReq");
    expectZelRequest<Zel_MediaResolutionsReq>("Zel_MediaResolutionsReq");
    expectZelRequest<Zel_MobBinaryDnDReq>("Zel_MobBinaryDnDReq");
    expectZelRequest<Zel_MobBinaryReq>("Zel_MobBinaryReq");
    expectZelRequest<Zel_MobHeadframeReq>("Zel_MobHeadframeReq");
    expectZelRequest<Zel_MobNodeReq>("Zel_MobNodeReq");
    expectZelRequest<Zel_MonikerReq>("Zel_MonikerReq");
    expectZelRequest<Zel_MoveNodeReq>("Zel_MoveNodeReq");
    expectZelRequest<Zel_NodePermissionsReq>("Zel_NodePermissionsReq");
    expectZelRequest<Zel_NodeReq>("Zel_NodeReq");
    expectZelRequest<Zel_NodeResolutionsReq>("Zel_NodeResolutionsReq");
    expectZelRequest<Zel_PropertyListReq>("Zel_PropertyListReq");
    expectZelRequest<Zel_QueryReq>("Zel_Query");
    expectZelRequest<Zel_RefreshNodeReq>("Zel_RefreshNodeReq");
    expectZelRequest<Zel_RemoveReservationReq>("Zel_RemoveReservationReq");
    expectZelRequest<Zel_RenameNodeReq>("Zel_RenameNodeReq");
    expectZelRequest<Zel_RenameUniqueReq>("Zel_RenameUniqueReq");
    expectZelRequest<Zel_SaveSettingsReq>("Zel_SaveSettingsReq");
    expectZelRequest<Zel_SetApplicationSettingsReq>("Zel_SetApplicationSettingsReq");
    expectZelRequest<Zel_SetPropertiesReq>("Zel_SetPropertiesReq");
    expectZelRequest<Zel_SetUserSettingsReq>("Zel_SetUserSettingsReq");
    expectZelRequest<Zel_StartupReq>("Zel_StartupReq");
    expectEngineRequest<Zel_GetPropertiesReq>("Zel_GetPropertiesReq");
    expectEngineRequest<Zel_LoginReq>("Zel_LoginReq");
    expectEngineRequest<Zel_RootNodeReq>("Zel_RootNodeReq");
}
