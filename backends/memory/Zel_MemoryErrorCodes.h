// Zel_MemoryErrorCodes: the stable error codes of the in-memory backend.
//
// Every failure the backend delivers to a failure handler carries one of
// these codes in its Zel_Error (a Zel_MemoryError), with a message that names
// what failed. The values never change between releases: applications and
// tests may compare against them. -1 is the library's "no error" and is never
// used here.
#ifndef ZEL_MEMORYERRORCODES_H
#define ZEL_MEMORYERRORCODES_H

namespace Zel_MemoryErrorCodes {

enum Code {
    // No node has the given moniker (or node ID).
    UnknownMoniker = 1001,
    // The session rejects the name (no word character, or an illegal character).
    InvalidName = 1002,
    // The user lacks the permission the operation needs (isPrivilegeError()).
    PermissionDenied = 1003,
    // Another user holds a reservation on the node (or on a node below it).
    ReservedByOtherUser = 1004,
    // The request needs a logged-in user.
    NotLoggedIn = 1005,
    // Unknown user or wrong password.
    LoginFailed = 1006,
    // The connection to the server is lost (until it is regained).
    NotConnected = 1007,
    // A sibling already has that name.
    NameExists = 1008,
    // The operation needs a folder (project, bin, folder, ...).
    NotAFolder = 1009,
    // A node cannot be moved or copied into itself or below itself; the root
    // cannot be moved, renamed or deleted.
    InvalidTarget = 1010,
    // The property may not be changed.
    PropertyNotModifiable = 1011,
    // The property key is not known to the server.
    UnknownProperty = 1012,
    // A property key of that name already exists.
    PropertyExists = 1013,
    // The node holds no reservation that could be removed.
    NotReserved = 1014,
    // A required argument is missing or empty.
    InvalidArgument = 1015,
    // A named item (locator, restriction, settings key, resolution) is unknown.
    NotFound = 1016,
    // The operation needs a media node (clip, sequence, effect, ...).
    NotMedia = 1017,
    // A conditional change found a value other than the expected one.
    ValueChanged = 1018,
    // A media file to be checked in is missing or invalid.
    InvalidMedia = 1019
};

} // namespace Zel_MemoryErrorCodes

#endif
