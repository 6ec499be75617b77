// Operations on media objects: analysis, check-in, check-in update, and the
// lookups by MobID (node, binary form, head frame).
#include "ops_p.h"

#include "Zel_AnalyzeCB.h"
#include "Zel_CheckinRes.h"
#include "Zel_CheckinUpdateRes.h"
#include "Zel_MobBinaryCB.h"
#include "Zel_MobBinaryDnDCB.h"
#include "Zel_MobDesc.h"
#include "Zel_MobHeadframeCB.h"
#include "Zel_MobNodeCB.h"

#include "Zel_Node.h"

#include <QFileInfo>

namespace ZelMemory {

namespace {

const QStringList MediaSuffixes = {QStringLiteral("mxf"), QStringLiteral("mov"), QStringLiteral("mp4"),
                                   QStringLiteral("wav"), QStringLiteral("aif"), QStringLiteral("aiff"),
                                   QStringLiteral("aaf"), QStringLiteral("omf"), QStringLiteral("avi"),
                                   QStringLiteral("mp3")};

QString mediaFileOf(const Zel_MobDesc& desc)
{
    if (!desc.getAAFFilePath().isEmpty())
        return desc.getAAFFilePath();
    if (!desc.getOMAAFFilePath().isEmpty())
        return desc.getOMAAFFilePath();
    return desc.getOMF2FilePath();
}

QString defaultResolution(ReadTxn& txn)
{
    for (const auto& setting : txn.workgroupSettings()) {
        if (setting.first == QLatin1String("Media.DefaultResolution"))
            return setting.second;
    }
    const QList<Resolution> resolutions = txn.resolutions();
    return resolutions.isEmpty() ? QString() : resolutions.first().id;
}

// A small head frame: a 16x9 binary PPM in the clip's colour.
QByteArray headFrame(const Node& node)
{
    int rgb = Zel_Node::colorFromName(propertyValue(node, QStringLiteral("Color")).toLatin1().constData());
    if (rgb < 0)
        rgb = 0x808080;
    QByteArray image("P6\n16 9\n255\n");
    for (int i = 0; i < 16 * 9; ++i) {
        image.append(static_cast<char>((rgb >> 16) & 0xFF));
        image.append(static_cast<char>((rgb >> 8) & 0xFF));
        image.append(static_cast<char>(rgb & 0xFF));
    }
    return image;
}

boost::shared_ptr<Zel_MobID> mobOf(const QString& id)
{
    return boost::shared_ptr<Zel_MobID>(new Zel_MobID(id));
}

} // namespace

void AnalyzeOp::run(Work& work, const Args& args, Result& result)
{
    if (args.files.isEmpty())
        fail(Zel_MemoryErrorCodes::InvalidArgument, QStringLiteral("No media files to analyse were given."));
    // One answer per file: a descriptor ready for check-in, or why not.
    for (const QString& file : args.files) {
        const QFileInfo info(file);
        if (file.isEmpty() || !MediaSuffixes.contains(info.suffix().toLower())) {
            result.fail(Zel_MemoryError::make(Zel_MemoryErrorCodes::InvalidMedia,
                                              QStringLiteral("\"%1\" is not a media file this server can check in.").arg(file)));
            continue;
        }
        boost::shared_ptr<Zel_MobDesc> desc(new Zel_MobDesc(newMobId(), file, QString()));
        if (info.suffix().compare(QLatin1String("omf"), Qt::CaseInsensitive) == 0) {
            desc->setAAFFilePath(QString());
            desc->setOMF2FilePath(file);
        }
        desc->setHeadFrameFilePath(info.path() + QLatin1Char('/') + info.completeBaseName() + QStringLiteral(".ppm"));
        result.succeed(desc);
    }
}
ZEL_MEMORY_EXECUTE(AnalyzeOp)

void CheckinOp::run(WriteWork& work, const Args& args, Result& result)
{
    const Node& folder = work.node(args.folder);
    work.requireFolder(folder);
    work.require(folder, PermAddFiles, QStringLiteral("check media in to"));
    work.requireNotReservedByOther(folder, QStringLiteral("check media in to"), false);
    if (args.mobs.size() == 0)
        fail(Zel_MemoryErrorCodes::InvalidArgument, QStringLiteral("No media objects to check in were given."));
    requireDepth(work, folder, 0);
    const QString resolution = defaultResolution(work.txn);
    // One answer per media object; one that cannot be checked in is reported
    // and the others go on.
    for (unsigned long long i = 0; i < args.mobs.size(); ++i) {
        boost::shared_ptr<Zel_MobDesc> desc = args.mobs.getMobDesc(i);
        if (!desc || desc->isNull()) {
            result.addItem(desc, boost::shared_ptr<Zel_Node>(), boost::shared_ptr<QString>(),
                           Zel_MemoryError::make(Zel_MemoryErrorCodes::InvalidMedia,
                                                 QStringLiteral("Media object %1 has no ID and no media file.").arg(i + 1)));
            continue;
        }
        const QString file = mediaFileOf(*desc);
        QString mobID = desc->getMobID().isEmpty() ? newMobId() : desc->getMobID();
        if (work.txn.nodeByMobId(mobID)) {
            result.addItem(desc, boost::shared_ptr<Zel_Node>(), boost::shared_ptr<QString>(),
                           Zel_MemoryError::make(Zel_MemoryErrorCodes::InvalidMedia,
                                                 QStringLiteral("Media object \"%1\" is checked in already; update it instead.").arg(mobID)));
            continue;
        }
        QString name = QFileInfo(file).completeBaseName();
        if (name.isEmpty() || name.size() > MaxNameLength || !work.session.isValidAssetName(name))
            name = QStringLiteral("Clip ") + mobID.right(8);
        Node node;
        node.name = uniqueChildName(work.txn, folder, name);
        node.mimeType = QStringLiteral("masterclip");
        node.mobId = mobID;
        node.created = node.modified = work.txn.now();
        node.properties.append(Property{QStringLiteral("Created By"), work.user, QString()});
        if (!file.isEmpty())
            node.media.append(Media{file, resolution});
        const Node& created = work.write.insertNode(std::move(node), folder);
        work.write.reportAdded(folder.moniker, created.moniker);
        result.addItem(desc, work.snapshot(created),
                       sharedText(QStringLiteral("checked in as \"%1\"").arg(created.name)), ok());
    }
}
ZEL_MEMORY_EXECUTE(CheckinOp)

void CheckinLocalBinOp::run(WriteWork& work, const Args& args, Result& result)
{
    const Node& folder = work.node(args.folder);
    work.requireFolder(folder);
    if (args.binFile.isEmpty())
        fail(Zel_MemoryErrorCodes::InvalidArgument, QStringLiteral("No bin file was given."));
    work.require(folder, PermAddFolders, QStringLiteral("check a bin in to"));
    work.requireNotReservedByOther(folder, QStringLiteral("check a bin in to"), false);
    const QString name = QFileInfo(args.binFile).completeBaseName();
    work.requireAssetName(name);
    requireDepth(work, folder, 0);
    // The bin arrives as a new bin of the folder, named after the file.
    Node bin;
    bin.name = uniqueChildName(work.txn, folder, name);
    bin.mimeType = QStringLiteral("bin");
    bin.created = bin.modified = work.txn.now();
    bin.properties.append(Property{QStringLiteral("Created By"), work.user, QString()});
    const Node& created = work.write.insertNode(std::move(bin), folder);
    work.write.reportAdded(folder.moniker, created.moniker);
    boost::shared_ptr<Zel_MobDesc> desc(new Zel_MobDesc(QString(), args.binFile, QString()));
    result.addItem(desc, work.snapshot(created), sharedText(QStringLiteral("checked in bin \"%1\"").arg(created.name)), ok());
}
ZEL_MEMORY_EXECUTE(CheckinLocalBinOp)

void CheckinUpdateOp::run(WriteWork& work, const Args& args, Result& result)
{
    if (args.mobs.size() == 0)
        fail(Zel_MemoryErrorCodes::InvalidArgument, QStringLiteral("No media objects to update were given."));
    for (unsigned long long i = 0; i < args.mobs.size(); ++i) {
        boost::shared_ptr<Zel_MobDesc> desc = args.mobs.getMobDesc(i);
        const WriteTxn::Savepoint point = work.write.savepoint();
        try {
            if (!desc)
                fail(Zel_MemoryErrorCodes::InvalidArgument, QStringLiteral("Media object %1 is empty.").arg(i + 1));
            const Node& node = work.nodeOfMob(desc->getMobID());
            work.require(node, PermWriteNewVersions, QStringLiteral("update the media of"));
            work.requireNotReservedByOther(node, QStringLiteral("update"), false);
            const QString file = mediaFileOf(*desc);
            const QString resolution = file.isEmpty() || !node.media.isEmpty() ? QString() : defaultResolution(work.txn);
            Node& record = work.write.edit(node);
            if (!file.isEmpty()) {
                if (record.media.isEmpty())
                    record.media.append(Media{file, resolution});
                else
                    record.media.first().path = file;
            }
            bool versioned = false;
            for (Property& p : record.properties) {
                if (p.key == QLatin1String("VersionNumber")) {
                    p.value = QString::number(p.value.toInt() + 1);
                    versioned = true;
                }
            }
            if (!versioned)
                record.properties.append(Property{QStringLiteral("VersionNumber"), QStringLiteral("2"), QString()});
            record.modified = work.txn.now();
            reportUpdated(work, node);
            result.addItem(ok());
        } catch (const Failure& failure) {
            work.write.rollbackTo(point);
            result.addItem(failure.error);
        }
    }
}
ZEL_MEMORY_EXECUTE(CheckinUpdateOp)

void MobNodeOp::run(Work& work, const Args& args, Result& result)
{
    result.succeed(work.snapshot(work.nodeOfMob(args.mob ? args.mob->toZelString() : QString())));
}
ZEL_MEMORY_EXECUTE(MobNodeOp)

void MobBinaryOp::run(Work& work, const Args& args, Result& result)
{
    const Node& node = work.nodeOfMob(args.mob ? args.mob->toZelString() : QString());
    result.succeed(mobOf(node.mobId), nodeJson(work.txn, node));
}
ZEL_MEMORY_EXECUTE(MobBinaryOp)

void MobBinaryDnDOp::run(Work& work, const Args& args, Result& result)
{
    if (args.mobs.size() == 0)
        fail(Zel_MemoryErrorCodes::InvalidArgument, QStringLiteral("No media objects were given."));
    for (unsigned long long i = 0; i < args.mobs.size(); ++i) {
        const boost::shared_ptr<Zel_MobID> mob = args.mobs.getMobID(i);
        try {
            const Node& node = work.nodeOfMob(mob ? mob->toZelString() : QString());
            result.succeed(mobOf(node.mobId), nodeJson(work.txn, node));
        } catch (const Failure& failure) {
            result.fail(failure.error);
        }
    }
}
ZEL_MEMORY_EXECUTE(MobBinaryDnDOp)

void MobHeadframeOp::run(Work& work, const Args& args, Result& result)
{
    const Node& node = work.nodeOfMob(args.mob ? args.mob->toZelString() : QString());
    work.requireMedia(node);
    result.succeed(mobOf(node.mobId), headFrame(node));
}
ZEL_MEMORY_EXECUTE(MobHeadframeOp)

} // namespace ZelMemory
