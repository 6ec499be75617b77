// The callback catalogue: every callback class has the same three members, so
// they are defined here once, with one macro line per class; the few classes
// with fields of their own follow.

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
#include "Zel_DependencyCB.h"
#include "Zel_DirCB.h"
#include "Zel_FrameLocatorListCB.h"
#include "Zel_FrameRestrictionListCB.h"
#include "Zel_GetApplicationSettingsCB.h"
#include "Zel_GetChildrenCB.h"
#include "Zel_GetReservationsCB.h"
#include "Zel_GetSettingsCB.h"
#include "Zel_GetUserSettingsCB.h"
#include "Zel_LoginBriefCB.h"
#include "Zel_LoginCB.h"
#include "Zel_MediaResolutionsCB.h"
#include "Zel_MobBinaryCB.h"
#include "Zel_MobBinaryDnDCB.h"
#include "Zel_MobHeadframeCB.h"
#include "Zel_MobNodeCB.h"
#include "Zel_MonikerCB.h"
#include "Zel_MoveNodeCB.h"
#include "Zel_NodeCB.h"
#include "Zel_NodePermissionsCB.h"
#include "Zel_NodeResolutionsCB.h"
#include "Zel_PropertyListCB.h"
#include "Zel_QueryCB.h"
#include "Zel_RefreshNodeCB.h"
#include "Zel_RemoveReservationCB.h"
#include "Zel_RenameNodeCB.h"
#include "Zel_RenameUniqueCB.h"
#include "Zel_ResultBoolCB.h"
#include "Zel_ResultCB.h"
#include "Zel_RootNodeCB.h"
#include "Zel_SaveSettingsCB.h"
#include "Zel_ServerCheckCB.h"
#include "Zel_SetApplicationSettingsCB.h"
#include "Zel_SetPropertiesCB.h"
#include "Zel_SetUserSettingsCB.h"
#include "Zel_SettingsCB.h"
#include "Zel_StartupCB.h"

#include "Orv_RequestID.h"

// A callback on the engine base: its identifier is of the callback type (-2).
#define ZEL_DEFINE_CALLBACK(Class)                                                     \
    Class::Class()                                                                     \
        : Orv_ResultsCB(Orv_RequestID(Orv_RequestID::Callback))                        \
    {                                                                                  \
    }                                                                                  \
    Class::Class(const Class& other) = default;                                        \
    Class::~Class() = default;

ZEL_DEFINE_CALLBACK(Zel_AnalyzeCB)
ZEL_DEFINE_CALLBACK(Zel_AssociationsCB)
ZEL_DEFINE_CALLBACK(Zel_CheckinCB)
ZEL_DEFINE_CALLBACK(Zel_CheckinUpdateCB)
ZEL_DEFINE_CALLBACK(Zel_ChildrenAtCB)
ZEL_DEFINE_CALLBACK(Zel_ChildrenAtMonikerCB)
ZEL_DEFINE_CALLBACK(Zel_ChildrenCB)
ZEL_DEFINE_CALLBACK(Zel_CopyNodeCB)
ZEL_DEFINE_CALLBACK(Zel_CreateFolderCB)
ZEL_DEFINE_CALLBACK(Zel_CreateFolderUniqueCB)
ZEL_DEFINE_CALLBACK(Zel_CreatePropertyCB)
ZEL_DEFINE_CALLBACK(Zel_CreateReservationCB)
ZEL_DEFINE_CALLBACK(Zel_DeleteCB)
ZEL_DEFINE_CALLBACK(Zel_DependencyCB)
ZEL_DEFINE_CALLBACK(Zel_DirCB)
ZEL_DEFINE_CALLBACK(Zel_FrameLocatorListCB)
ZEL_DEFINE_CALLBACK(Zel_FrameRestrictionListCB)
ZEL_DEFINE_CALLBACK(Zel_GetApplicationSettingsCB)
ZEL_DEFINE_CALLBACK(Zel_GetChildrenCB)
ZEL_DEFINE_CALLBACK(Zel_GetReservationsCB)
ZEL_DEFINE_CALLBACK(Zel_GetSettingsCB)
ZEL_DEFINE_CALLBACK(Zel_GetUserSettingsCB)
ZEL_DEFINE_CALLBACK(Zel_LoginBriefCB)
ZEL_DEFINE_CALLBACK(Zel_LoginCB)
ZEL_DEFINE_CALLBACK(Zel_MediaResolutionsCB)
ZEL_DEFINE_CALLBACK(Zel_MobBinaryCB)
ZEL_DEFINE_CALLBACK(Zel_MobBinaryDnDCB)
ZEL_DEFINE_CALLBACK(Zel_MobHeadframeCB)
ZEL_DEFINE_CALLBACK(Zel_MobNodeCB)
ZEL_DEFINE_CALLBACK(Zel_MonikerCB)
ZEL_DEFINE_CALLBACK(Zel_MoveNodeCB)
ZEL_DEFINE_CALLBACK(Zel_NodeCB)
ZEL_DEFINE_CALLBACK(Zel_NodePermissionsCB)
ZEL_DEFINE_CALLBACK(Zel_NodeResolutionsCB)
ZEL_DEFINE_CALLBACK(Zel_PropertyListCB)
ZEL_DEFINE_CALLBACK(Zel_QueryCB)
ZEL_DEFINE_CALLBACK(Zel_RefreshNodeCB)
ZEL_DEFINE_CALLBACK(Zel_RemoveReservationCB)
ZEL_DEFINE_CALLBACK(Zel_RenameNodeCB)
ZEL_DEFINE_CALLBACK(Zel_RenameUniqueCB)
ZEL_DEFINE_CALLBACK(Zel_ResultBoolCB)
ZEL_DEFINE_CALLBACK(Zel_ResultCB)
ZEL_DEFINE_CALLBACK(Zel_RootNodeCB)
ZEL_DEFINE_CALLBACK(Zel_SaveSettingsCB)
ZEL_DEFINE_CALLBACK(Zel_ServerCheckCB)
ZEL_DEFINE_CALLBACK(Zel_SetApplicationSettingsCB)
ZEL_DEFINE_CALLBACK(Zel_SetPropertiesCB)
ZEL_DEFINE_CALLBACK(Zel_SetUserSettingsCB)
ZEL_DEFINE_CALLBACK(Zel_SettingsCB)
ZEL_DEFINE_CALLBACK(Zel_StartupCB)

Zel_ConditionalSetPropertiesCB::Zel_ConditionalSetPropertiesCB() = default;
Zel_ConditionalSetPropertiesCB::Zel_ConditionalSetPropertiesCB(const Zel_ConditionalSetPropertiesCB& other) = default;
Zel_ConditionalSetPropertiesCB::~Zel_ConditionalSetPropertiesCB() = default;

void Zel_ChildrenAtMonikerCB::setParentMoniker(boost::shared_ptr<QString> parentMoniker)
{
    mParentMoniker = std::move(parentMoniker);
}

void Zel_ChildrenAtMonikerCB::setParentNode(boost::shared_ptr<Zel_Node> parentNode)
{
    mParentNode = std::move(parentNode);
}

const boost::shared_ptr<QString>& Zel_ChildrenAtMonikerCB::getParentMoniker() const
{
    return mParentMoniker;
}

const boost::shared_ptr<Zel_Node>& Zel_ChildrenAtMonikerCB::getParentNode() const
{
    return mParentNode;
}

void Zel_QueryCB::setQuerySpec(boost::shared_ptr<Zel_QuerySpec> querySpec)
{
    mQuerySpec = std::move(querySpec);
}

const boost::shared_ptr<Zel_QuerySpec>& Zel_QueryCB::getQuerySpec() const
{
    return mQuerySpec;
}
