// Operations of the session: login, start-up, and the settings the server
// stores for users, applications and the workgroup, exchanged as XML text in
// the form of Zel_SettingList::toXML.
#include "memory_ops_p.h"

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

#include <QDomDocument>
#include <QDomElement>
#include <QUuid>

namespace ZelMemory {

namespace {

QString settingsXml(const SettingPairs& pairs, const QString& root)
{
    Zel_SettingList list;
    for (const auto& pair : pairs)
        list.addIfKeyNotInList(Zel_Setting(pair.first, pair.second));
    return list.toXML(root);
}

void collectLeaves(const QDomElement& element, const QString& prefix, SettingPairs& out)
{
    bool hasChildElements = false;
    for (QDomElement child = element.firstChildElement(); !child.isNull(); child = child.nextSiblingElement()) {
        hasChildElements = true;
        collectLeaves(child, prefix.isEmpty() ? child.tagName() : prefix + QLatin1Char('.') + child.tagName(), out);
    }
    if (!hasChildElements && !prefix.isEmpty()) {
        for (auto& pair : out) {
            if (pair.first == prefix) {
                pair.second = element.text();
                return;
            }
        }
        out.append(qMakePair(prefix, element.text()));
    }
}

// The settings of an XML document: every leaf element below the root, its
// key the dotted path of element names. Malformed XML fails with its position.
SettingPairs settingsFromXml(const QString& xml)
{
    QDomDocument document;
    QString message;
    int line = 0;
    int column = 0;
    if (!document.setContent(xml, &message, &line, &column))
        fail(Zel_MemoryErrorCodes::InvalidArgument,
             QStringLiteral("The settings are not well-formed XML (line %1, column %2: %3).").arg(line).arg(column).arg(message));
    SettingPairs pairs;
    collectLeaves(document.documentElement(), QString(), pairs);
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
    QString name;
    {
        ReadHold hold(work.tree);
        const User* user = work.tree.user(args.user);
        // One message for both faults: a login does not tell which names exist.
        if (!user || user->password != args.password)
            fail(Zel_MemoryErrorCodes::LoginFailed, QStringLiteral("Login failed: unknown user or wrong password."));
        name = user->name;
    }
    const QString sessionID = QUuid::createUuid().toString().remove(QLatin1Char('{')).remove(QLatin1Char('}'));
    work.session.setLogin(name, sessionID, QDateTime::currentDateTimeUtc());
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
    ReadHold hold(work.tree);
    result.setResult(settingsXml(work.tree.applicationSettings.value(args.application), QStringLiteral("ApplicationSettings")), ok());
}
ZEL_MEMORY_EXECUTE(GetApplicationSettingsOp)

void SetApplicationSettingsOp::run(Work& work, const Args& args, Result& result)
{
    requireName(args.application, QStringLiteral("application name"));
    const SettingPairs pairs = settingsFromXml(args.xml);
    WriteHold hold(work.tree);
    work.tree.applicationSettings.insert(args.application, pairs);
    result.setResult(ok());
}
ZEL_MEMORY_EXECUTE(SetApplicationSettingsOp)

void GetUserSettingsOp::run(Work& work, const Args& args, Result& result)
{
    requireType(args.type);
    ReadHold hold(work.tree);
    const SettingPairs pairs = work.tree.userSettings.value(work.user).value(static_cast<int>(args.type));
    result.setResult(args.type, settingsXml(pairs, QStringLiteral("UserSettings")), ok());
}
ZEL_MEMORY_EXECUTE(GetUserSettingsOp)

void SetUserSettingsOp::run(Work& work, const Args& args, Result& result)
{
    requireType(args.type);
    const SettingPairs pairs = settingsFromXml(args.xml);
    WriteHold hold(work.tree);
    work.tree.userSettings[work.user].insert(static_cast<int>(args.type), pairs);
    result.setResult(ok());
}
ZEL_MEMORY_EXECUTE(SetUserSettingsOp)

void GetWorkgroupSettingsOp::run(Work& work, const Args&, Result& result)
{
    ReadHold hold(work.tree);
    result.setResult(settingsXml(work.tree.workgroupSettings, QStringLiteral("WorkgroupSettings")), ok());
}
ZEL_MEMORY_EXECUTE(GetWorkgroupSettingsOp)

void GetSettingsOp::run(Work& work, const Args& args, Result& result)
{
    requireName(args.name, QStringLiteral("settings name"));
    ReadHold hold(work.tree);
    auto it = work.tree.documents.constFind(args.name);
    if (it == work.tree.documents.constEnd())
        fail(Zel_MemoryErrorCodes::NotFound, QStringLiteral("No settings are stored under the name \"%1\".").arg(args.name));
    result.succeed(it.value());
}
ZEL_MEMORY_EXECUTE(GetSettingsOp)

void SaveSettingsOp::run(Work& work, const Args& args, Result& result)
{
    requireName(args.name, QStringLiteral("settings name"));
    settingsFromXml(args.xml); // well-formed, or the request fails
    WriteHold hold(work.tree);
    work.tree.documents.insert(args.name, args.xml);
    result.succeed();
}
ZEL_MEMORY_EXECUTE(SaveSettingsOp)

} // namespace ZelMemory
