// Zel_MemoryErrorCodes: the stable error codes of the in-memory backend.
//
// Every failure the backend delivers to a failure handler carries one of
// these codes in its Zel_Error (a Zel_MemoryError), with a message that names
// what failed. The values never change between releases and are never reused:
// applications and tests may compare against them (by name). -1 is the
// library's "no error" and is never used here.
//
// Beside each code: what it means and which requests produce it. "Any request
// on a node" means every request that names a node by moniker, path or media
// object ID (the lookup and its read check come first).
#ifndef ZEL_MEMORYERRORCODES_H
#define ZEL_MEMORYERRORCODES_H

namespace Zel_MemoryErrorCodes {

enum Code {
    // No node has the given moniker or lies at the given path. Any request
    // on a node by moniker or path; AddDependency for a dependency's moniker.
    UnknownMoniker = 1001,
    // The name is too long, or the session rejects it (no word character, or
    // an illegal character). CreateFolder, CreateFolderUnique,
    // CreateNodeUnique, RenameNode, RenameUnique, CheckinLocalBin (names);
    // CreateProperty, CreateNodeUnique (property names).
    InvalidName = 1002,
    // The user lacks the permission the operation needs (isPrivilegeError()).
    // Any request on a node (read permission); every change for the
    // permission it needs; GetUserPriviledges for other users; Delete for
    // remote media the user may not destroy (per media file).
    PermissionDenied = 1003,
    // Another user holds a reservation on the node (or on a node below it).
    // Every change of a node or of a folder's children; RemoveReservation of
    // another user's reservation.
    ReservedByOtherUser = 1004,
    // The request needs a logged-in user. Every request but Login.
    NotLoggedIn = 1005,
    // Unknown user or wrong password. Login.
    LoginFailed = 1006,
    // The connection to the server is lost (until it is regained), or the
    // session is closed. Every request.
    NotConnected = 1007,
    // A sibling already has that name. CreateFolder, RenameNode, MoveNode.
    NameExists = 1008,
    // The operation needs a folder (project, bin, folder, ...). Children,
    // GetChildren, ChildrenAt, ChildrenAtMoniker, the create requests,
    // MoveNode and CopyNode (destination), Checkin, CheckinLocalBin.
    NotAFolder = 1009,
    // A node cannot be moved or copied into itself or below itself; the root
    // cannot be moved, copied, renamed or deleted. MoveNode, CopyNode,
    // RenameNode, RenameUnique, DeleteNode, Delete (per asset).
    InvalidTarget = 1010,
    // The property may not be changed (Name, Mime Type, MobID, or a key
    // described as not modifiable). SetProperties.
    PropertyNotModifiable = 1011,
    // The property key is not known to the server. SetProperties,
    // GetProperties.
    UnknownProperty = 1012,
    // The node has a property of that name already. CreateProperty.
    PropertyExists = 1013,
    // The node holds no reservation that could be removed. RemoveReservation.
    NotReserved = 1014,
    // A required argument is missing, empty or malformed: no moniker, an
    // empty query, no properties, frame locators or media objects, an unknown
    // mime type or user settings type, a reservation ending in the past, a
    // frame locator ID given twice, settings XML that is not well-formed or
    // exceeds the settings limits. Most requests that take arguments.
    InvalidArgument = 1015,
    // A named item is unknown: a frame locator or restriction to delete, a
    // named settings document, a user, a media object ID, the synced project
    // of a node, local media of a media object, the root. DeleteFrameLocator-
    // List, DeleteFrameRestrictionList, GetSettings, GetUserPriviledges,
    // MobNode, MobBinary, MobBinaryDnD, MobHeadframe, CheckinUpdate,
    // GetSyncedProjRoot, Delete (local media), RootNode.
    NotFound = 1016,
    // The operation needs a media node (clip, sequence, effect, ...).
    // NodeResolutions, MobHeadframe, the frame locator and restriction
    // requests.
    NotMedia = 1017,
    // Not produced by this backend: a conditional SetProperties whose values
    // differ is answered through Zel_ConditionalSetPropertiesCB::
    // conditionFailed. The value stays reserved.
    ValueChanged = 1018,
    // A media file to be checked in is missing or invalid, or its media
    // object is on the server already. Analyze, Checkin (per media object).
    InvalidMedia = 1019,
    // The node, or a node of the subtree, would lie deeper below the root
    // than the server allows (ZelMemory::MaxDepth levels). CreateFolder,
    // CreateFolderUnique, CreateNodeUnique, MoveNode, CopyNode, Checkin,
    // CheckinLocalBin.
    TooDeep = 1020,
    // Another node has the media object ID given for a new node.
    // CreateNodeUnique.
    MobIDExists = 1021,
    // The server failed in a way no rule foresees (out of memory, a fault of
    // the backend itself, an exception of the session's fault hook); the
    // message names what was thrown where it has a text. Any request.
    Internal = 1022,
    // The request was cancelled (cancelAllRequests, close, or its callback's
    // cancelRequest) before it ran; its callback hears this and finished().
    // Any request.
    Cancelled = 1023
};

} // namespace Zel_MemoryErrorCodes

#endif
