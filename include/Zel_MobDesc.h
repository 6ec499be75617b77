// Zel_MobDesc: names a media object and the paths of its media files.
//
// The MobID text, the AAF, OM-AAF, OMF2 and head-frame file paths and the
// generate-Fex-SPAAF flag. isNull() is true when the MobID text and the AAF,
// OMF2 and head-frame paths are all empty (the OM-AAF path and the flag are
// not consulted). Plain value.
#ifndef ZEL_MOBDESC_H
#define ZEL_MOBDESC_H

#include "zel_export.h"

#include <QString>

class ZEL_EXPORT Zel_MobDesc
{
public:
    // All texts empty, flag false.
    Zel_MobDesc();
    // The OM-AAF and OMF2 paths stay empty and the flag false.
    Zel_MobDesc(const QString& mobID, const QString& aafFilePath, const QString& headFrameFilePath);
    Zel_MobDesc(const Zel_MobDesc& other);
    Zel_MobDesc& operator=(const Zel_MobDesc& other);
    virtual ~Zel_MobDesc();

    const QString& getMobID() const;
    void setMobID(const QString& mobID);
    const QString& getAAFFilePath() const;
    void setAAFFilePath(const QString& path);
    const QString& getOMAAFFilePath() const;
    void setOMAAFFilePath(const QString& path);
    const QString& getOMF2FilePath() const;
    void setOMF2FilePath(const QString& path);
    const QString& getHeadFrameFilePath() const;
    void setHeadFrameFilePath(const QString& path);
    bool getGenerateFexSpaaf() const;
    void setGenerateFexSpaaf(bool generate);

    bool isNull() const;

private:
    QString mMobID;
    QString mAAFFilePath;
    QString mOMAAFFilePath;
    QString mOMF2FilePath;
    QString mHeadFrameFilePath;
    bool mGenerateFexSpaaf;
};

#endif
