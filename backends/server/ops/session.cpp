// Operations of the session: login, start-up, and the settings the server
// stores for users, applications and the workgroup, exchanged as XML text in
// the form of Zel_SettingList::toXML.
#include "ops_p.h"

#include "Zel_GetApplicationSettingsRes.h"
#include "Zel_GetSettingsCB.h"
#include "Zel_GetUserSettingsRes.h"
#include "Zel_LoginCB.h"
#include "Zel_SaveSettingsCB.h"
#include "Zel_SetApplicationSettingsRes.h"
#include "Zel_SetUserSettingsRes.h"
#include "Zel_SettingList.h"
#include "Zel_SettingsRes.h"
#include "Zel_StartupRes.h"

#include <QHash>
#include <QUuid>
#include <QXmlStreamReader>

#include <vector>

namespace ZelMemory {

namespace {

QString settingsXml(const SettingPairs& pairs, const QString& root)
{
    // Stored keys are distinct (one per leaf, see settingsFromXml; a tree
    // file's settings are JSON members), so no lookup per setting is needed.
    Zel_SettingList list;
    list.reserve(pairs.size());
    for (const auto& pair : pairs)
        list.append(Zel_Setting(pair.first, pair.second));
    return list.toXML(root);
}

// The settings of an XML document: every leaf element below the root, its
// key the dotted path of element names below the root, its value the
// element's text; a later leaf with the same key replaces the value of the
// earlier one, which keeps its place. Fails with InvalidArgument, naming the
// position, when the XML is not well-formed or exceeds the settings limits
// (MaxSettingsLevels and the others). The document is read as a stream, one
// token at a time, without recursion and without building a tree; each key
// is built from its parent's by appending one level.
SettingPairs settingsFromXml(const QString& xml)
{
    if (xml.size() > MaxSettingsSize)
        fail(Zel_MemoryErrorCodes::InvalidArgument,
             QStringLiteral("The settings document has %1 characters; the server accepts at most %2.")
                 .arg(xml.size())
                 .arg(MaxSettingsSize));
    QXmlStreamReader reader(xml);
    reader.setNamespaceProcessing(false); // names are taken whole, prefix and all
    SettingPairs pairs;
    QHash<QString, int> indexOfKey;
    qint64 stored = 0;
    QString key;                   // the key of the innermost open element below the root
    std::vector<int> parentLength; // per open element below the root: its parent's key length
    int open = 0;                  // open elements, the root included
    bool leaf = false;             // the innermost open element has no child element yet
    QString text;                  // its text so far
    bool blank = true;             // that text is only white space outside CDATA
    auto refuse = [&reader](const QString& what) {
        fail(Zel_MemoryErrorCodes::InvalidArgument,
             QStringLiteral("The settings %1 (line %2, column %3).").arg(what).arg(reader.lineNumber()).arg(reader.columnNumber()));
    };
    while (!reader.atEnd()) {
        switch (reader.readNext()) {
        case QXmlStreamReader::StartElement:
            if (open > 0) {
                if (open > MaxSettingsLevels)
                    refuse(QStringLiteral("nest deeper than %1 levels below the root").arg(MaxSettingsLevels));
                parentLength.push_back(key.size());
                if (open > 1)
                    key += QLatin1Char('.');
                key += reader.qualifiedName();
                if (key.size() > MaxSettingsKeyLength)
                    refuse(QStringLiteral("have a key longer than %1 characters").arg(MaxSettingsKeyLength));
            }
            ++open;
            leaf = true;
            text.clear();
            blank = true;
            break;
        case QXmlStreamReader::Characters:
            if (leaf) {
                text += reader.text();
                blank = blank && reader.isWhitespace() && !reader.isCDATA();
            }
            break;
        case QXmlStreamReader::EndElement:
            // White space alone is layout, not a value (as the DOM reads it).
            if (blank)
                text.clear();
            if (leaf && open > 1) {
                auto known = indexOfKey.constFind(key);
                if (known == indexOfKey.constEnd()) {
                    if (pairs.size() >= MaxSettingsCount)
                        refuse(QStringLiteral("hold more than %1 keys").arg(MaxSettingsCount));
                    stored += key.size() + text.size();
                    indexOfKey.insert(key, pairs.size());
                    pairs.append(qMakePair(key, text));
                } else {
                    QString& value = pairs[known.value()].second;
                    stored += text.size() - value.size();
                    value = text;
                }
                if (stored > MaxSettingsSize)
                    refuse(QStringLiteral("keys and values come to more than %1 characters").arg(MaxSettingsSize));
            }
            --open;
            if (!parentLength.empty()) {
                key.truncate(parentLength.back());
                parentLength.pop_back();
            }
            leaf = false;
            text.clear();
            break;
        default:
            break;
        }
    }
    if (reader.hasError())
        fail(Zel_MemoryErrorCodes::InvalidArgument,
             QStringLiteral("The settings are not well-formed XML (line %1, column %2: %3).")
                 .arg(reader.lineNumber())
                 .arg(reader.columnNumber())
                 .arg(reader.errorString()));
    return pairs;
}

void requireType(Zel_GetUserSettingsCB::UserSettingsType type)
{
    if (userSettingsTypeName(static_cast<int>(type))[0] == '\0')
        fail(Zel_MemoryErrorCodes::InvalidArgument,
             QStringLiteral("Unknown user settings type %1 (expected general, project or site).").arg(static_cast<int>(type)));
}

void requireName(const QString& name, const QString& what)
{
    if (name.trimmed().isEmpty())
        fail(Zel_MemoryErrorCodes::InvalidArgument, QStringLiteral("No %1 was given.").arg(what));
}

} // namespace

void LoginOp::run(Work& work, const Args& args, Result& result)
{
    const User* user = work.txn.user(args.user);
    // One message for both faults: a login does not tell which names exist.
    if (!user || user->password != args.password)
        fail(Zel_MemoryErrorCodes::LoginFailed, QStringLiteral("Login failed: unknown user or wrong password."));
    const QString name = user->name;
    const QString sessionID = QUuid::createUuid().toString().remove(QLatin1Char('{')).remove(QLatin1Char('}'));
    SessionState& session = work.session;
    const QDateTime time = work.txn.now();
    work.txn.onCommit([&session, name, sessionID, time] { session.setLogin(name, sessionID, time); });
    result.succeed(name);
}
ZEL_MEMORY_EXECUTE(LoginOp)

void StartupOp::run(Work&, const Args&, Result& result)
{
    // Nothing to prepare in memory: a logged-in session is ready.
    result.setError(ok());
}
ZEL_MEMORY_EXECUTE(StartupOp)

void GetApplicationSettingsOp::run(Work& work, const Args& args, Result& result)
{
    requireName(args.application, QStringLiteral("application name"));
    result.setResult(settingsXml(work.txn.applicationSettings(args.application), QStringLiteral("ApplicationSettings")), ok());
}
ZEL_MEMORY_EXECUTE(GetApplicationSettingsOp)

void SetApplicationSettingsOp::run(WriteWork& work, const Args& args, Result& result)
{
    requireName(args.application, QStringLiteral("application name"));
    const SettingPairs pairs = settingsFromXml(args.xml);
    work.write.setApplicationSettings(args.application, pairs);
    result.setResult(ok());
}
ZEL_MEMORY_EXECUTE(SetApplicationSettingsOp)

void GetUserSettingsOp::run(Work& work, const Args& args, Result& result)
{
    requireType(args.type);
    const SettingPairs pairs = work.txn.userSettings(work.user, static_cast<int>(args.type));
    result.setResult(args.type, settingsXml(pairs, QStringLiteral("UserSettings")), ok());
}
ZEL_MEMORY_EXECUTE(GetUserSettingsOp)

void SetUserSettingsOp::run(WriteWork& work, const Args& args, Result& result)
{
    requireType(args.type);
    const SettingPairs pairs = settingsFromXml(args.xml);
    work.write.setUserSettings(work.user, static_cast<int>(args.type), pairs);
    result.setResult(ok());
}
ZEL_MEMORY_EXECUTE(SetUserSettingsOp)

void GetWorkgroupSettingsOp::run(Work& work, const Args&, Result& result)
{
    result.setResult(settingsXml(work.txn.workgroupSettings(), QStringLiteral("WorkgroupSettings")), ok());
}
ZEL_MEMORY_EXECUTE(GetWorkgroupSettingsOp)

void GetSettingsOp::run(Work& work, const Args& args, Result& result)
{
    requireName(args.name, QStringLiteral("settings name"));
    QString xml;
    if (!work.txn.document(args.name, xml))
        fail(Zel_MemoryErrorCodes::NotFound, QStringLiteral("No settings are stored under the name \"%1\".").arg(args.name));
    result.succeed(xml);
}
ZEL_MEMORY_EXECUTE(GetSettingsOp)

void SaveSettingsOp::run(WriteWork& work, const Args& args, Result& result)
{
    requireName(args.name, QStringLiteral("settings name"));
    settingsFromXml(args.xml); // well-formed, or the request fails
    work.write.setDocument(args.name, args.xml);
    result.succeed();
}
ZEL_MEMORY_EXECUTE(SaveSettingsOp)

} // namespace ZelMemory
