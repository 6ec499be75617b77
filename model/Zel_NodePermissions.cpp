#include "Zel_NodePermissions.h"

#include <utility>

// The thirty flags in declaration order. Each entry expands the accessor pair
// (and the copy of the field) for one flag.
#define ZEL_NODE_PERMISSION_FLAGS(X) \
    X(IsOwner)                       \
    X(IsAdmin)                       \
    X(HasSendToPlayback)             \
    X(HasReadAllLogs)                \
    X(HasUseHighResolution)          \
    X(HasUseLowResolution)           \
    X(HasArchiveRestore)             \
    X(HasUserAttributeManagement)    \
    X(HasCanCreateColumns)           \
    X(HasCanModifyColumns)           \
    X(HasCanModifyPropertiesInAccess)\
    X(HasRead)                       \
    X(HasCopy)                       \
    X(HasAddFiles)                   \
    X(HasAddFolders)                 \
    X(HasWriteAttributes)            \
    X(HasWriteUserAttributes)        \
    X(HasWriteNewVersions)           \
    X(HasCanWriteLocators)           \
    X(HasCanWriteDRMs)               \
    X(HasDeleteAssets)               \
    X(HasDestroyAssets)              \
    X(HasDestroyMedia)               \
    X(HasReserve)                    \
    X(HasOverrideReservation)        \
    X(HasPermissionsManagement)      \
    X(HasCanCreateLocators)          \
    X(HasCanModifyLocators)          \
    X(HasCanCreateRestrictions)      \
    X(HasCanModifyRestrictions)

#define ZEL_FLAG_INIT_FALSE(Name) , m##Name(false)
#define ZEL_FLAG_INIT_COPY(Name) , m##Name(other.m##Name)
#define ZEL_FLAG_ASSIGN(Name) m##Name = other.m##Name;
#define ZEL_FLAG_ACCESSORS(Name)                                        \
    void Zel_NodePermissions::set##Name(const bool& value) { m##Name = value; } \
    const bool& Zel_NodePermissions::get##Name() const { return m##Name; }

Zel_NodePermissions::Zel_NodePermissions()
    : mMoniker() ZEL_NODE_PERMISSION_FLAGS(ZEL_FLAG_INIT_FALSE)
{
}

Zel_NodePermissions::Zel_NodePermissions(boost::shared_ptr<QString> moniker,
                                         bool isOwner,
                                         bool isAdmin,
                                         bool hasSendToPlayback,
                                         bool hasReadAllLogs,
                                         bool hasUseHighResolution,
                                         bool hasUseLowResolution,
                                         bool hasArchiveRestore,
                                         bool hasUserAttributeManagement,
                                         bool hasCanCreateColumns,
                                         bool hasCanModifyColumns,
                                         bool hasCanModifyPropertiesInAccess,
                                         bool hasRead,
                                         bool hasCopy,
                                         bool hasAddFiles,
                                         bool hasAddFolders,
                                         bool hasWriteAttributes,
                                         bool hasWriteUserAttributes,
                                         bool hasWriteNewVersions,
                                         bool hasCanWriteLocators,
                                         bool hasCanWriteDRMs,
                                         bool hasDeleteAssets,
                                         bool hasDestroyAssets,
                                         bool hasDestroyMedia,
                                         bool hasReserve,
                                         bool hasOverrideReservation,
                                         bool hasPermissionsManagement,
                                         bool hasCanCreateLocators,
                                         bool hasCanModifyLocators,
                                         bool hasCanCreateRestrictions,
                                         bool hasCanModifyRestrictions)
    : mMoniker(std::move(moniker))
    , mIsOwner(isOwner)
    , mIsAdmin(isAdmin)
    , mHasSendToPlayback(hasSendToPlayback)
    , mHasReadAllLogs(hasReadAllLogs)
    , mHasUseHighResolution(hasUseHighResolution)
    , mHasUseLowResolution(hasUseLowResolution)
    , mHasArchiveRestore(hasArchiveRestore)
    , mHasUserAttributeManagement(hasUserAttributeManagement)
    , mHasCanCreateColumns(hasCanCreateColumns)
    , mHasCanModifyColumns(hasCanModifyColumns)
    , mHasCanModifyPropertiesInAccess(hasCanModifyPropertiesInAccess)
    , mHasRead(hasRead)
    , mHasCopy(hasCopy)
    , mHasAddFiles(hasAddFiles)
    , mHasAddFolders(hasAddFolders)
    , mHasWriteAttributes(hasWriteAttributes)
    , mHasWriteUserAttributes(hasWriteUserAttributes)
    , mHasWriteNewVersions(hasWriteNewVersions)
    , mHasCanWriteLocators(hasCanWriteLocators)
    , mHasCanWriteDRMs(hasCanWriteDRMs)
    , mHasDeleteAssets(hasDeleteAssets)
    , mHasDestroyAssets(hasDestroyAssets)
    , mHasDestroyMedia(hasDestroyMedia)
    , mHasReserve(hasReserve)
    , mHasOverrideReservation(hasOverrideReservation)
    , mHasPermissionsManagement(hasPermissionsManagement)
    , mHasCanCreateLocators(hasCanCreateLocators)
    , mHasCanModifyLocators(hasCanModifyLocators)
    , mHasCanCreateRestrictions(hasCanCreateRestrictions)
    , mHasCanModifyRestrictions(hasCanModifyRestrictions)
{
}

Zel_NodePermissions::Zel_NodePermissions(const Zel_NodePermissions& other)
    : mMoniker(other.mMoniker) ZEL_NODE_PERMISSION_FLAGS(ZEL_FLAG_INIT_COPY)
{
}

Zel_NodePermissions& Zel_NodePermissions::operator=(const Zel_NodePermissions& other)
{
    if (this != &other) {
        mMoniker = other.mMoniker;
        ZEL_NODE_PERMISSION_FLAGS(ZEL_FLAG_ASSIGN)
    }
    return *this;
}

Zel_NodePermissions::~Zel_NodePermissions() = default;

void Zel_NodePermissions::setMoniker(const boost::shared_ptr<QString>& moniker)
{
    mMoniker = moniker;
}

const boost::shared_ptr<QString>& Zel_NodePermissions::getMoniker() const
{
    return mMoniker;
}

ZEL_NODE_PERMISSION_FLAGS(ZEL_FLAG_ACCESSORS)

#undef ZEL_FLAG_ACCESSORS
#undef ZEL_FLAG_ASSIGN
#undef ZEL_FLAG_INIT_COPY
#undef ZEL_FLAG_INIT_FALSE
#undef ZEL_NODE_PERMISSION_FLAGS

namespace {

struct FlagToken
{
    bool Zel_NodePermissions::*flag;
    const char* setForm;
    const char* clearForm;
};

} // namespace

QString Zel_NodePermissions::toZelString() const
{
    // Rendering order: the declaration order with IsAdmin ahead of IsOwner.
    // Every token ends in a blank; IsAdmin's clear form also starts with one.
    static const FlagToken tokens[] = {
        {&Zel_NodePermissions::mIsAdmin, "A ", " a "},
        {&Zel_NodePermissions::mIsOwner, "O ", "o "},
        {&Zel_NodePermissions::mHasSendToPlayback, "STP ", "stp "},
        {&Zel_NodePermissions::mHasReadAllLogs, "RAL ", "ral "},
        {&Zel_NodePermissions::mHasUseHighResolution, "HR ", "hr "},
        {&Zel_NodePermissions::mHasUseLowResolution, "LR ", "lr "},
        {&Zel_NodePermissions::mHasArchiveRestore, "AR ", "ar "},
        {&Zel_NodePermissions::mHasUserAttributeManagement, "UAM ", "uam "},
        {&Zel_NodePermissions::mHasCanCreateColumns, "CC ", "cc "},
        {&Zel_NodePermissions::mHasCanModifyColumns, "MC ", "mc "},
        {&Zel_NodePermissions::mHasCanModifyPropertiesInAccess, "MPA ", "mpa "},
        {&Zel_NodePermissions::mHasRead, "R ", "r "},
        {&Zel_NodePermissions::mHasCopy, "C ", "c "},
        {&Zel_NodePermissions::mHasAddFiles, "FI ", "fi "},
        {&Zel_NodePermissions::mHasAddFolders, "FO ", "fo "},
        {&Zel_NodePermissions::mHasWriteAttributes, "WA ", "wa "},
        {&Zel_NodePermissions::mHasWriteUserAttributes, "WUA ", "wua "},
        {&Zel_NodePermissions::mHasWriteNewVersions, "WNV ", "wnv "},
        {&Zel_NodePermissions::mHasCanWriteLocators, "WL ", "wl "},
        {&Zel_NodePermissions::mHasCanWriteDRMs, "WD ", "wd "},
        {&Zel_NodePermissions::mHasDeleteAssets, "DELA ", "dela "},
        {&Zel_NodePermissions::mHasDestroyAssets, "DESA ", "desa "},
        {&Zel_NodePermissions::mHasDestroyMedia, "DESM ", "desm "},
        {&Zel_NodePermissions::mHasReserve, "RES ", "res "},
        {&Zel_NodePermissions::mHasOverrideReservation, "OVRES ", "ovres "},
        {&Zel_NodePermissions::mHasPermissionsManagement, "PM ", "pm "},
        {&Zel_NodePermissions::mHasCanCreateLocators, "CL ", "cl "},
        {&Zel_NodePermissions::mHasCanModifyLocators, "ML ", "ml "},
        {&Zel_NodePermissions::mHasCanCreateRestrictions, "CR ", "cr "},
        {&Zel_NodePermissions::mHasCanModifyRestrictions, "MR ", "mr "},
    };

    QString text;
    text.reserve(128 + (mMoniker ? mMoniker->size() : 0));
    text += QLatin1Char('{');
    for (const FlagToken& token : tokens)
        text += QLatin1String(this->*token.flag ? token.setForm : token.clearForm);
    text += QLatin1String("} ");
    if (mMoniker)
        text += *mMoniker;
    return text;
}
