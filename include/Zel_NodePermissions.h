// Zel_NodePermissions: the rights the current user holds on one node.
//
// Thirty independent yes/no flags together with the moniker of the node they
// belong to. The backend fills one and hands it to the application through the
// node-permissions result; the class checks nothing itself. Every accessor is
// virtual so that a backend may derive its own permission class.
//
// toZelString() renders the set for the trace log on one line: each flag as a
// short abbreviation, upper case when set, lower case when clear, then the
// moniker text (empty when no moniker is held):
//
//     { a O stp ral hr lr ... cr mr } /projects/demo
//
// Copies share the moniker text object. A plain value: no locks.
#ifndef ZEL_NODEPERMISSIONS_H
#define ZEL_NODEPERMISSIONS_H

#include "zel_export.h"

#include <QString>
#include <boost/shared_ptr.hpp>

class ZEL_EXPORT Zel_NodePermissions
{
public:
    // Empty moniker pointer, every flag false.
    Zel_NodePermissions();
    // The moniker, then the thirty flags in declaration order.
    Zel_NodePermissions(boost::shared_ptr<QString> moniker,
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
                        bool hasCanModifyRestrictions);
    Zel_NodePermissions(const Zel_NodePermissions& other);
    Zel_NodePermissions& operator=(const Zel_NodePermissions& other);
    virtual ~Zel_NodePermissions();

    virtual void setMoniker(const boost::shared_ptr<QString>& moniker);
    virtual const boost::shared_ptr<QString>& getMoniker() const;

    virtual void setIsOwner(const bool& value);
    virtual const bool& getIsOwner() const;
    virtual void setIsAdmin(const bool& value);
    virtual const bool& getIsAdmin() const;
    virtual void setHasSendToPlayback(const bool& value);
    virtual const bool& getHasSendToPlayback() const;
    virtual void setHasReadAllLogs(const bool& value);
    virtual const bool& getHasReadAllLogs() const;
    virtual void setHasUseHighResolution(const bool& value);
    virtual const bool& getHasUseHighResolution() const;
    virtual void setHasUseLowResolution(const bool& value);
    virtual const bool& getHasUseLowResolution() const;
    virtual void setHasArchiveRestore(const bool& value);
    virtual const bool& getHasArchiveRestore() const;
    virtual void setHasUserAttributeManagement(const bool& value);
    virtual const bool& getHasUserAttributeManagement() const;
    virtual void setHasCanCreateColumns(const bool& value);
    virtual const bool& getHasCanCreateColumns() const;
    virtual void setHasCanModifyColumns(const bool& value);
    virtual const bool& getHasCanModifyColumns() const;
    virtual void setHasCanModifyPropertiesInAccess(const bool& value);
    virtual const bool& getHasCanModifyPropertiesInAccess() const;
    virtual void setHasRead(const bool& value);
    virtual const bool& getHasRead() const;
    virtual void setHasCopy(const bool& value);
    virtual const bool& getHasCopy() const;
    virtual void setHasAddFiles(const bool& value);
    virtual const bool& getHasAddFiles() const;
    virtual void setHasAddFolders(const bool& value);
    virtual const bool& getHasAddFolders() const;
    virtual void setHasWriteAttributes(const bool& value);
    virtual const bool& getHasWriteAttributes() const;
    virtual void setHasWriteUserAttributes(const bool& value);
    virtual const bool& getHasWriteUserAttributes() const;
    virtual void setHasWriteNewVersions(const bool& value);
    virtual const bool& getHasWriteNewVersions() const;
    virtual void setHasCanWriteLocators(const bool& value);
    virtual const bool& getHasCanWriteLocators() const;
    virtual void setHasCanWriteDRMs(const bool& value);
    virtual const bool& getHasCanWriteDRMs() const;
    virtual void setHasDeleteAssets(const bool& value);
    virtual const bool& getHasDeleteAssets() const;
    virtual void setHasDestroyAssets(const bool& value);
    virtual const bool& getHasDestroyAssets() const;
    virtual void setHasDestroyMedia(const bool& value);
    virtual const bool& getHasDestroyMedia() const;
    virtual void setHasReserve(const bool& value);
    virtual const bool& getHasReserve() const;
    virtual void setHasOverrideReservation(const bool& value);
    virtual const bool& getHasOverrideReservation() const;
    virtual void setHasPermissionsManagement(const bool& value);
    virtual const bool& getHasPermissionsManagement() const;
    virtual void setHasCanCreateLocators(const bool& value);
    virtual const bool& getHasCanCreateLocators() const;
    virtual void setHasCanModifyLocators(const bool& value);
    virtual const bool& getHasCanModifyLocators() const;
    virtual void setHasCanCreateRestrictions(const bool& value);
    virtual const bool& getHasCanCreateRestrictions() const;
    virtual void setHasCanModifyRestrictions(const bool& value);
    virtual const bool& getHasCanModifyRestrictions() const;

    // "{" + one token per flag + "} " + moniker text, from the stored flags;
    // an empty moniker pointer renders as an empty text.
    QString toZelString() const;

private:
    boost::shared_ptr<QString> mMoniker;
    bool mIsOwner;
    bool mIsAdmin;
    bool mHasSendToPlayback;
    bool mHasReadAllLogs;
    bool mHasUseHighResolution;
    bool mHasUseLowResolution;
    bool mHasArchiveRestore;
    bool mHasUserAttributeManagement;
    bool mHasCanCreateColumns;
    bool mHasCanModifyColumns;
    bool mHasCanModifyPropertiesInAccess;
    bool mHasRead;
    bool mHasCopy;
    bool mHasAddFiles;
    bool mHasAddFolders;
    bool mHasWriteAttributes;
    bool mHasWriteUserAttributes;
    bool mHasWriteNewVersions;
    bool mHasCanWriteLocators;
    bool mHasCanWriteDRMs;
    bool mHasDeleteAssets;
    bool mHasDestroyAssets;
    bool mHasDestroyMedia;
    bool mHasReserve;
    bool mHasOverrideReservation;
    bool mHasPermissionsManagement;
    bool mHasCanCreateLocators;
    bool mHasCanModifyLocators;
    bool mHasCanCreateRestrictions;
    bool mHasCanModifyRestrictions;
};

#endif
