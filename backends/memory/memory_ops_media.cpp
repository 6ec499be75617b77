// Operations on media objects: analysis, check-in, check-in update, and the
// lookups by MobID (node, binary form, head frame).
#include "memory_ops_p.h"

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

QString defaultResolution(const Tree& tree)
{
    for (const auto& setting : tree.workgroupSettings) {
        if (setting.first == QLatin1String("Media.DefaultResolution"))
            return setting.second;
    }
    return tree.resolutions.isEmpty() ? QString() : tree.resolutions.first().id;
}

// A small head frame: a 16x9 binary PPM in the clip's colour.
QByteArray headFrame(const Tree& tree, const Node& node)
{
    int rgb = Zel_Node::colorFromName(tree.propertyValue(node, QStringLiteral("Color")).toLatin1().constData());
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
    WriteHold hold(work.tree); // new MobIDs come from the tree's counter
    // One answer per file: a descriptor ready for check-in, or why not.
    for (const QString& file : args.files) {
        const QFileInfo info(file);
        if (file.isEmpty() || !MediaSuffixes.contains(info.suffix().toLower())) {
            result.fail(Zel_MemoryError::make(Zel_MemoryErrorCodes::InvalidMedia,
                                              QStringLiteral("\"%1\" is not a media file this server can check in.").arg(file)));
            continue;
        }
        boost::shared_ptr<Zel_MobDesc> desc(new Zel_MobDesc(work.tree.newMobId(), file, QString()));
        if (info.suffix().compare(QLatin1String("omf"), Qt::CaseInsensitive) == 0) {
            desc->setAAFFilePath(QString());
            desc->setOMF2FilePath(file);
        }
        desc->setHeadFrameFilePath(info.path() + QLatin1Char('/') + info.completeBaseName() + QStringLiteral(".ppm"));
        result.succeed(desc);
    }
}
ZEL_MEMORY_EXECUTE(AnalyzeOp)

void CheckinOp::run(Work& work, const Args& args, Result& result)
{
    WriteHold hold(work.tree);
    Node& folder = work.node(args.folder);
    work.requireFolder(folder);
    work.require(folder, PermAddFiles, QStringLiteral("check media in to"));
    work.requireNotReservedByOther(folder, QStringLiteral("check media in to"), false);
    if (args.mobs.size() == 0)
        fail(Zel_MemoryErrorCodes::InvalidArgument, QStringLiteral("No media objects to check in were given."));
    requireDepth(work, folder, 0);
    const QString resolution = defaultResolution(work.tree);
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
        QString mobID = desc->getMobID().isEmpty() ? work.tree.newMobId() : desc->getMobID();
        if (work.tree.byMobId(mobID)) {
            result.addItem(desc, boost::shared_ptr<Zel_Node>(), boost::shared_ptr<QString>(),
                           Zel_MemoryError::make(Zel_MemoryErrorCodes::InvalidMedia,
                                                 QStringLiteral("Media object \"%1\" is checked in already; update it instead.").arg(mobID)));
            continue;
        }
        QString name = QFileInfo(file).completeBaseName();
        if (name.isEmpty() || name.size() > MaxNameLength || !work.session.isValidAssetName(name))
            name = QStringLiteral("Clip ") + mobID.right(8);
        Node node;
        node.id = work.tree.newNodeId();
        node.moniker = monikerOfId(node.id);
        node.name = work.tree.uniqueChildName(folder, name);
        node.mimeType = QStringLiteral("masterclip");
        node.mobId = mobID;
        node.created = node.modified = QDateTime::currentDateTimeUtc();
        node.properties.append(Property{QStringLiteral("Created By"), work.user, QString()});
        if (!file.isEmpty())
            node.media.append(Media{file, resolution});
        Node& created = work.tree.insertNode(std::move(node), folder);
        hold.added(folder.moniker, created.moniker);
        result.addItem(desc, work.snapshot(created),
                       sharedText(QStringLiteral("checked in as \"%1\"").arg(created.name)), ok());
    }
}
ZEL_MEMORY_EXECUTE(CheckinOp)

void CheckinLocalBinOp::run(Work& work, const Args& args, Result& result)
{
    WriteHold hold(work.tree);
    Node& folder = work.node(args.folder);
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
    bin.id = work.tree.newNodeId();
    bin.moniker = monikerOfId(bin.id);
    bin.name = work.tree.uniqueChildName(folder, name);
    bin.mimeType = QStringLiteral("bin");
    bin.created = bin.modified = QDateTime::currentDateTimeUtc();
    bin.properties.append(Property{QStringLiteral("Created By"), work.user, QString()});
    Node& created = work.tree.insertNode(std::move(bin), folder);
    hold.added(folder.moniker, created.moniker);
    boost::shared_ptr<Zel_MobDesc> desc(new Zel_MobDesc(QString(), args.binFile, QString()));
    result.addItem(desc, work.snapshot(created), sharedText(QStringLiteral("checked in bin \"%1\"").arg(created.name)), ok());
}
ZEL_MEMORY_EXECUTE(CheckinLocalBinOp)

void CheckinUpdateOp::run(Work& work, const Args& args, Result& result)
{
    if (args.mobs.size() == 0)
        fail(Zel_MemoryErrorCodes::InvalidArgument, QStringLiteral("No media objects to update were given."));
    WriteHold hold(work.tree);
    for (unsigned long long i = 0; i < args.mobs.size(); ++i) {
        boost::shared_ptr<Zel_MobDesc> desc = args.mobs.getMobDesc(i);
        try {
            if (!desc)
                fail(Zel_MemoryErrorCodes::InvalidArgument, QStringLiteral("Media object %1 is empty.").arg(i + 1));
            Node& node = work.nodeOfMob(desc->getMobID());
            work.require(node, PermWriteNewVersions, QStringLiteral("update the media of"));
            work.requireNotReservedByOther(node, QStringLiteral("update"), false);
            const QString file = mediaFileOf(*desc);
            if (!file.isEmpty()) {
                if (node.media.isEmpty())
                    node.media.append(Media{file, defaultResolution(work.tree)});
                else
                    node.media.first().path = file;
            }
            bool versioned = false;
            for (Property& p : node.properties) {
                if (p.key == QLatin1String("VersionNumber")) {
                    p.value = QString::number(p.value.toInt() + 1);
                    versioned = true;
                }
            }
            if (!versioned)
                node.properties.append(Property{QStringLiteral("VersionNumber"), QStringLiteral("2"), QString()});
            node.modified = QDateTime::currentDateTimeUtc();
            if (const Node* parent = work.tree.parentOf(node))
                hold.updated(parent->moniker, node.moniker);
            result.addItem(ok());
        } catch (const Failure& failure) {
            result.addItem(failure.error);
        }
    }
}
ZEL_MEMORY_EXECUTE(CheckinUpdateOp)

void MobNodeOp::run(Work& work, const Args& args, Result& result)
{
    ReadHold hold(work.tree);
    result.succeed(work.snapshot(work.nodeOfMob(args.mob ? args.mob->toZelString() : QString())));
}
ZEL_MEMORY_EXECUTE(MobNodeOp)

void MobBinaryOp::run(Work& work, const Args& args, Result& result)
{
    ReadHold hold(work.tree);
    const Node& node = work.nodeOfMob(args.mob ? args.mob->toZelString() : QString());
    result.succeed(mobOf(node.mobId), nodeJson(work.tree, node));
}
ZEL_MEMORY_EXECUTE(MobBinaryOp)

void MobBinaryDnDOp::run(Work& work, const Args& args, Result& result)
{
    if (args.mobs.size() == 0)
        fail(Zel_MemoryErrorCodes::InvalidArgument, QStringLiteral("No media objects were given."));
    ReadHold hold(work.tree);
    for (unsigned long long i = 0; i < args.mobs.size(); ++i) {
        const boost::shared_ptr<Zel_MobID> mob = args.mobs.getMobID(i);
        try {
            const Node& node = work.nodeOfMob(mob ? mob->toZelString() : QString());
            result.succeed(mobOf(node.mobId), nodeJson(work.tree, node));
        } catch (const Failure& failure) {
            result.fail(failure.error);
        }
    }
}
ZEL_MEMORY_EXECUTE(MobBinaryDnDOp)

void MobHeadframeOp::run(Work& work, const Args& args, Result& result)
{
    ReadHold hold(work.tree);
    const Node& node = work.nodeOfMob(args.mob ? args.mob->toZelString() : QString());
    work.requireMedia(node);
    result.succeed(mobOf(node.mobId), headFrame(work.tree, node));
}
ZEL_MEMORY_EXECUTE(MobHeadframeOp)

} // namespace ZelMemory
