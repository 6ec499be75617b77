// Zel_MimeTypeValue: the mime types the library knows, one bit each.
//
// The bits combine into the masks of Zel_MimeTypeSpec. "masterclip" and
// "clip" share Zel_MimeType_MasterClip. The bits 0x1 to 0x100000 are all used;
// the underlying type is a fixed 32-bit unsigned integer, so combined masks
// can be held with static_cast<Zel_MimeTypeValue>(mask).
#ifndef ZEL_MIMETYPEVALUE_H
#define ZEL_MIMETYPEVALUE_H

#include <QtGlobal>

enum Zel_MimeTypeValue : quint32
{
    Zel_MimeType_MasterClip = 0x1,            // "masterclip", "clip"
    Zel_MimeType_Sequence = 0x2,              // "sequence"
    Zel_MimeType_SubClip = 0x4,               // "subclip"
    Zel_MimeType_Group = 0x8,                 // "group"
    Zel_MimeType_MotionEffect = 0x10,         // "motioneffect"
    Zel_MimeType_Effect = 0x20,               // "effect"
    Zel_MimeType_RenderedEffect = 0x40,       // "renderedeffect"
    Zel_MimeType_AudioClip = 0x80,            // "audioclip"
    Zel_MimeType_FileMob = 0x100,             // "filemob"
    Zel_MimeType_Project = 0x200,             // "project"
    Zel_MimeType_Bin = 0x400,                 // "bin"
    Zel_MimeType_Folder = 0x800,              // "folder"
    Zel_MimeType_Catalog = 0x1000,            // "catalog"
    Zel_MimeType_Workspace = 0x2000,          // "workspace"
    Zel_MimeType_PlaybackDevices = 0x4000,    // "playbackdevices"
    Zel_MimeType_MasterClipEWC = 0x8000,      // "masterclipewc"
    Zel_MimeType_AudioClipEWC = 0x10000,      // "audioclipewc"
    Zel_MimeType_Asset = 0x20000,             // "Asset"
    Zel_MimeType_Physical = 0x40000,          // "physical"
    Zel_MimeType_StereoMasterClip = 0x80000,  // "stereomasterclip"
    Zel_MimeType_StereoSubClip = 0x100000     // "stereosubclip"
};

// The two groups the library and backends sort nodes into.
// Containers: project, bin, folder, catalog, workspace, playbackdevices.
constexpr quint32 Zel_MimeTypes_Containers = 0x7E00;
// Media: every clip, sequence, effect, group and filemob type.
constexpr quint32 Zel_MimeTypes_Media = 0x1981FF;

#endif
