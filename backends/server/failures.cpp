// A failure as the only answer of each library result class.
#include "ops_p.h"

#include "Zel_AddDependencyRes.h"
#include "Zel_AssociationsRes.h"
#include "Zel_CheckinRes.h"
#include "Zel_CheckinUpdateRes.h"
#include "Zel_ChildrenRes.h"
#include "Zel_CreateFolderUniqueRes.h"
#include "Zel_CreateNodeUniqueRes.h"
#include "Zel_CreateReservationRes.h"
#include "Zel_DeleteNodeRes.h"
#include "Zel_DeleteRes.h"
#include "Zel_GetApplicationSettingsRes.h"
#include "Zel_GetChildrenRes.h"
#include "Zel_GetLinkedProjectsRes.h"
#include "Zel_GetNodeRes.h"
#include "Zel_GetReservationsRes.h"
#include "Zel_GetSyncedProjRootRes.h"
#include "Zel_GetUserSettingsRes.h"
#include "Zel_MediaResolutionsRes.h"
#include "Zel_NodePermissionsRes.h"
#include "Zel_NodeResolutionsRes.h"
#include "Zel_RemoveReservationRes.h"
#include "Zel_RenameUniqueRes.h"
#include "Zel_SetApplicationSettingsRes.h"
#include "Zel_SetUserSettingsRes.h"
#include "Zel_SettingsRes.h"
#include "Zel_StartupRes.h"

#include "Zel_MobDesc.h"
#include "Zel_Node.h"
#include "Zel_NodePermissions.h"

typedef boost::shared_ptr<Zel_Error> ErrorSP;
typedef boost::shared_ptr<Zel_Node> NodeSP;

void failInto(Zel_AddDependencyRes& r, const ErrorSP& e) { r.setResult(NodeSP(), Zel_DependencySPList(), e); }
void failInto(Zel_AssociationsRes& r, const ErrorSP& e) { r.setResult(boost::shared_ptr<Zel_Directory>(), e); }
void failInto(Zel_CheckinRes& r, const ErrorSP& e)
{
    r.addItem(boost::shared_ptr<Zel_MobDesc>(), NodeSP(), boost::shared_ptr<QString>(), e);
}
void failInto(Zel_CheckinUpdateRes& r, const ErrorSP& e) { r.addItem(e); }
void failInto(Zel_ChildrenRes& r, const ErrorSP& e) { r.setResult(NodeSP(), NodeSP(), e); }
void failInto(Zel_CreateFolderUniqueRes& r, const ErrorSP& e) { r.setResult(NodeSP(), e); }
void failInto(Zel_CreateNodeUniqueRes& r, const ErrorSP& e) { r.setResult(NodeSP(), e); }
void failInto(Zel_CreateReservationRes& r, const ErrorSP& e) { r.setResult(e); }
void failInto(Zel_DeleteNodeRes& r, const ErrorSP& e) { r.setResult(false, e); }
void failInto(Zel_DeleteRes& r, const ErrorSP& e) { r.setErrorResult(e); }
void failInto(Zel_GetApplicationSettingsRes& r, const ErrorSP& e) { r.setResult(QString(), e); }
void failInto(Zel_GetChildrenRes& r, const ErrorSP& e) { r.setResult(NodeSP(), e); }
void failInto(Zel_GetLinkedProjectsRes& r, const ErrorSP& e) { r.setResult(NodeSP(), e); }
void failInto(Zel_GetNodeRes& r, const ErrorSP& e) { r.setResult(NodeSP(), e); }
void failInto(Zel_GetReservationsRes& r, const ErrorSP& e) { r.setResult(QString(), QDateTime(), e); }
void failInto(Zel_GetSyncedProjRootRes& r, const ErrorSP& e) { r.setResult(NodeSP(), e); }
void failInto(Zel_GetUserSettingsRes& r, const ErrorSP& e)
{
    r.setResult(Zel_GetUserSettingsCB::UserSettingsUnknown, QString(), e);
}
void failInto(Zel_MediaResolutionsRes& r, const ErrorSP& e) { r.setResult(Zel_PropertyKeyInfoList(), e); }
void failInto(Zel_NodePermissionsRes& r, const ErrorSP& e) { r.setResult(boost::shared_ptr<Zel_NodePermissions>(), e); }
void failInto(Zel_NodeResolutionsRes& r, const ErrorSP& e)
{
    r.setResult(boost::shared_ptr<Zel_MobID>(), boost::shared_ptr<QString>(), e);
}
void failInto(Zel_RemoveReservationRes& r, const ErrorSP& e) { r.setResult(e); }
void failInto(Zel_RenameUniqueRes& r, const ErrorSP& e) { r.setResult(NodeSP(), e); }
void failInto(Zel_SetApplicationSettingsRes& r, const ErrorSP& e) { r.setResult(e); }
void failInto(Zel_SetUserSettingsRes& r, const ErrorSP& e) { r.setResult(e); }
void failInto(Zel_SettingsRes& r, const ErrorSP& e) { r.setResult(QString(), e); }
void failInto(Zel_StartupRes& r, const ErrorSP& e) { r.setError(e); }
