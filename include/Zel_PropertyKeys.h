// Zel_PropertyKeys: the names of the server's well-known property keys.
//
// Constant texts, initialised when the library is loaded and never changed, so
// that the application and the backend spell the server's keys alike. The
// texts are case-sensitive and contain blanks where shown (for instance
// Zel_PropKey_MimeType is "Mime Type"). The library itself never reads them.
// Do not use them from the initialiser of another static object: their
// initialisation order relative to other libraries is not defined.
#ifndef ZEL_PROPERTYKEYS_H
#define ZEL_PROPERTYKEYS_H

#include "zel_export.h"

#include <QString>

extern ZEL_EXPORT const QString Zel_PropKey_Name;                       // "Name"
extern ZEL_EXPORT const QString Zel_PropKey_MobID;                      // "MobID"
extern ZEL_EXPORT const QString Zel_PropKey_Duration;                   // "Duration"
extern ZEL_EXPORT const QString Zel_PropKey_Tape;                       // "Tape"
extern ZEL_EXPORT const QString Zel_PropKey_TapeID;                     // "TapeID"
extern ZEL_EXPORT const QString Zel_PropKey_ModifiedDate;               // "ModifiedDate"
extern ZEL_EXPORT const QString Zel_PropKey_Tracks;                     // "Tracks"
extern ZEL_EXPORT const QString Zel_PropKey_Comments;                   // "Comments"
extern ZEL_EXPORT const QString Zel_PropKey_MimeType;                   // "Mime Type"
extern ZEL_EXPORT const QString Zel_PropKey_OmmMobComplete;             // "_OMM_MOB_COMPLETE"
extern ZEL_EXPORT const QString Zel_PropKey_EwcExpectedDur;             // "_EWC_EXPECTED_DUR"
extern ZEL_EXPORT const QString Zel_PropKey_EwcKnownMediaDur;           // "_EWC_KNOWN_MEDIA_DUR"
extern ZEL_EXPORT const QString Zel_PropKey_QmOffsetToSource;           // "_QM_OFFSET_TO_SOURCE"
extern ZEL_EXPORT const QString Zel_PropKey_QmSourceMobID;              // "_QM_SOURCE_MOBID"
extern ZEL_EXPORT const QString Zel_PropKey_QmTrackInfo;                // "_QM_TRACK_INFO"
extern ZEL_EXPORT const QString Zel_PropKey_MetadataType;               // "MetadataType"
extern ZEL_EXPORT const QString Zel_PropKey_Frame;                      // "Frame"
extern ZEL_EXPORT const QString Zel_PropKey_MarkIN;                     // "MarkIN"
extern ZEL_EXPORT const QString Zel_PropKey_MarkOUT;                    // "MarkOUT"
extern ZEL_EXPORT const QString Zel_PropKey_KopWorkgroupStatus;         // "KOP_Workgroup_Status"
extern ZEL_EXPORT const QString Zel_PropKey_Position;                   // "Position"
extern ZEL_EXPORT const QString Zel_PropKey_Start;                      // "Start"
extern ZEL_EXPORT const QString Zel_PropKey_CreationDate;               // "CreationDate"
extern ZEL_EXPORT const QString Zel_PropKey_SCRT;                       // "SCRT"
extern ZEL_EXPORT const QString Zel_PropKey_SMOT;                       // "SMOT"
extern ZEL_EXPORT const QString Zel_PropKey_SCIT;                       // "SCIT"
extern ZEL_EXPORT const QString Zel_PropKey_SIMT;                       // "SIMT"
extern ZEL_EXPORT const QString Zel_PropKey_CategoryValues;             // "Category_Values"
extern ZEL_EXPORT const QString Zel_PropKey_Category;                   // "Category"
extern ZEL_EXPORT const QString Zel_PropKey_LocatorAnnotationValues;    // "LocatorAnnotationValues"
extern ZEL_EXPORT const QString Zel_PropKey_StoryID;                    // "Story_ID"
extern ZEL_EXPORT const QString Zel_PropKey_ReviewSequence;             // "ReviewSequence"
extern ZEL_EXPORT const QString Zel_PropKey_Path;                       // "Path"
extern ZEL_EXPORT const QString Zel_PropKey_KopServerAuthOwner;         // "KopServer_AuthOwner"
extern ZEL_EXPORT const QString Zel_PropKey_KopServerWGContainsDRMClip; // "KopServer_WG_ContainsDRMClip"
extern ZEL_EXPORT const QString Zel_PropKey_CustomList;                 // "CustomList"
extern ZEL_EXPORT const QString Zel_PropKey_CreatedBy;                  // "Created By"
extern ZEL_EXPORT const QString Zel_PropKey_AppliedDefaults;            // "AppliedDefaults"
extern ZEL_EXPORT const QString Zel_PropKey_DurationTC;                 // "_DurationTC_"
extern ZEL_EXPORT const QString Zel_PropKey_VersionNumber;              // "VersionNumber"
extern ZEL_EXPORT const QString Zel_PropKey_LockedBy;                   // "Locked By"
extern ZEL_EXPORT const QString Zel_PropKey_LockedOn;                   // "Locked On"
extern ZEL_EXPORT const QString Zel_PropKey_Color;                      // "Color"
extern ZEL_EXPORT const QString Zel_PropKey_SyncedProjectGUID;          // "SyncedProject_GUID"
extern ZEL_EXPORT const QString Zel_PropKey_SyncedProjectType;          // "SyncedProject_Type"

#endif
