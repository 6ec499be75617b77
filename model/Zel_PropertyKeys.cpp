#include "Zel_PropertyKeys.h"
#include "Zel_SequenceKeys.h"

// Defined with external linkage (the header's extern declarations precede
// them) and initialised when the library is loaded.
const QString Zel_PropKey_Name = QStringLiteral("Name");
const QString Zel_PropKey_MobID = QStringLiteral("MobID");
const QString Zel_PropKey_Duration = QStringLiteral("Duration");
const QString Zel_PropKey_Tape = QStringLiteral("Tape");
const QString Zel_PropKey_TapeID = QStringLiteral("TapeID");
const QString Zel_PropKey_ModifiedDate = QStringLiteral("ModifiedDate");
const QString Zel_PropKey_Tracks = QStringLiteral("Tracks");
const QString Zel_PropKey_Comments = QStringLiteral("Comments");
const QString Zel_PropKey_MimeType = QStringLiteral("Mime Type");
const QString Zel_PropKey_OmmMobComplete = QStringLiteral("_OMM_MOB_COMPLETE");
const QString Zel_PropKey_EwcExpectedDur = QStringLiteral("_EWC_EXPECTED_DUR");
const QString Zel_PropKey_EwcKnownMediaDur = QStringLiteral("_EWC_KNOWN_MEDIA_DUR");
const QString Zel_PropKey_QmOffsetToSource = QStringLiteral("_QM_OFFSET_TO_SOURCE");
const QString Zel_PropKey_QmSourceMobID = QStringLiteral("_QM_SOURCE_MOBID");
const QString Zel_PropKey_QmTrackInfo = QStringLiteral("_QM_TRACK_INFO");
const QString Zel_PropKey_MetadataType = QStringLiteral("MetadataType");
const QString Zel_PropKey_Frame = QStringLiteral("Frame");
const QString Zel_PropKey_MarkIN = QStringLiteral("MarkIN");
const QString Zel_PropKey_MarkOUT = QStringLiteral("MarkOUT");
const QString Zel_PropKey_KopWorkgroupStatus = QStringLiteral("KOP_Workgroup_Status");
const QString Zel_PropKey_Position = QStringLiteral("Position");
const QString Zel_PropKey_Start = QStringLiteral("Start");
const QString Zel_PropKey_CreationDate = QStringLiteral("CreationDate");
const QString Zel_PropKey_SCRT = QStringLiteral("SCRT");
const QString Zel_PropKey_SMOT = QStringLiteral("SMOT");
const QString Zel_PropKey_SCIT = QStringLiteral("SCIT");
const QString Zel_PropKey_SIMT = QStringLiteral("SIMT");
const QString Zel_PropKey_CategoryValues = QStringLiteral("Category_Values");
const QString Zel_PropKey_Category = QStringLiteral("Category");
const QString Zel_PropKey_LocatorAnnotationValues = QStringLiteral("LocatorAnnotationValues");
const QString Zel_PropKey_StoryID = QStringLiteral("Story_ID");
const QString Zel_PropKey_ReviewSequence = QStringLiteral("ReviewSequence");
const QString Zel_PropKey_Path = QStringLiteral("Path");
const QString Zel_PropKey_KopServerAuthOwner = QStringLiteral("KopServer_AuthOwner");
const QString Zel_PropKey_KopServerWGContainsDRMClip = QStringLiteral("KopServer_WG_ContainsDRMClip");
const QString Zel_PropKey_CustomList = QStringLiteral("CustomList");
const QString Zel_PropKey_CreatedBy = QStringLiteral("Created By");
const QString Zel_PropKey_AppliedDefaults = QStringLiteral("AppliedDefaults");
const QString Zel_PropKey_DurationTC = QStringLiteral("_DurationTC_");
const QString Zel_PropKey_VersionNumber = QStringLiteral("VersionNumber");
const QString Zel_PropKey_LockedBy = QStringLiteral("Locked By");
const QString Zel_PropKey_LockedOn = QStringLiteral("Locked On");
const QString Zel_PropKey_Color = QStringLiteral("Color");
const QString Zel_PropKey_SyncedProjectGUID = QStringLiteral("SyncedProject_GUID");
const QString Zel_PropKey_SyncedProjectType = QStringLiteral("SyncedProject_Type");

const QString Zel_MasterAndSonarisSequence = QStringLiteral("Master and Sonaris Sequence");
const QString Zel_SonarisSequence = QStringLiteral("Sonaris_Sequence");
