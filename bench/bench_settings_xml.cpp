// Settings XML: Zel_SettingList::toXML against its peer, building the same
// document with QDomDocument by hand (a QHash from key prefix to element for
// the lookups) and writing it with toString(1), as an application without
// zel would.
//
// Two shapes of settings:
//   app     an application's settings: four-level keys that share their upper
//           levels ("App.Group12.Section3.Key7"), one flat key in fifty
//           ("Recent40"), short values, some with characters XML escapes
//           ("a < b & c").
//   groups  as many distinct top-level groups as settings ("g<i>.k<j>"), one
//           key in three a level deeper ("g<i>.s<m>.k<j>"); the group numbers
//           come in a scrambled order, so that each new group lands among
//           all the others. A wide root: a lookup that scans the siblings
//           makes this quadratic.
// Before the rows run, the peer's text is checked to equal toXML's, so both
// rows build the same document.
//
// Rows:
//   settings/toXML/<shape>/N   list.toXML("Settings", fixed moment)
//   settings/dom/<shape>/N     the same document built by hand with QDomDocument,
//                              no name or character checks, then toString(1)
// Targets:
//   toXML/groups/100000 at most 12x the time of toXML/groups/10000 (linear growth);
//   toXML at most 0.5x the time of the DOM by hand, per shape and size.
#include "BenchSupport.h"

#include "Zel_Setting.h"
#include "Zel_SettingList.h"

#include <QDateTime>
#include <QDomDocument>
#include <QDomElement>
#include <QDomText>
#include <QHash>
#include <QString>
#include <QStringList>

#include <cstdio>
#include <cstdlib>
#include <string>

namespace {

Zel_SettingList makeAppSettings(int count)
{
    Zel_SettingList list;
    list.reserve(count);
    for (int i = 0; i < count; ++i) {
        if (i % 50 == 49) {
            list.append(Zel_Setting(QStringLiteral("Recent%1").arg(i), QStringLiteral("/media/show/reel %1.mxf").arg(i)));
            continue;
        }
        const QString key = QStringLiteral("App.Group%1.Section%2.Key%3").arg(i / 100).arg((i / 10) % 10).arg(i % 10);
        const QString value = i % 7 == 0 ? QStringLiteral("a < b & c %1").arg(i) : QStringLiteral("value %1").arg(i);
        list.append(Zel_Setting(key, value));
    }
    return list;
}

Zel_SettingList makeGroupSettings(int count)
{
    Zel_SettingList list;
    list.reserve(count);
    for (int i = 0; i < count; ++i) {
        // 7919 is prime and divides no power of ten: i -> group is a permutation.
        const long long group = (static_cast<long long>(i) * 7919) % count;
        const QString key = i % 3 == 2 ? QStringLiteral("g%1.s%2.k%3").arg(group).arg(i % 5).arg(i % 10)
                                       : QStringLiteral("g%1.k%2").arg(group).arg(i % 10);
        list.append(Zel_Setting(key, i % 7 == 0 ? QStringLiteral("x < y & \"z\" %1").arg(i) : QString::number(i)));
    }
    return list;
}

Zel_SettingList makeSettings(const std::string& shape, int count)
{
    return shape == "app" ? makeAppSettings(count) : makeGroupSettings(count);
}

// The peer: the same document, built straight from the keys. Intermediate
// levels are found by their key prefix; the last level is always a new
// element (and, like toXML, is found as a parent by a longer key).
QString buildWithDom(const Zel_SettingList& settings, const QString& rootName, const QDateTime& moment)
{
    QDomDocument document;
    QDomElement root = document.createElement(rootName);
    document.appendChild(root);
    QHash<QString, QDomElement> elements;

    for (const Zel_Setting& setting : settings) {
        const QString key = setting.key();
        const QStringList levels = key.split(QLatin1Char('.'));
        QDomElement parent = root;
        QString prefix;
        for (int i = 0; i < levels.size() - 1; ++i) {
            if (i > 0)
                prefix += QLatin1Char('.');
            prefix += levels.at(i);
            QHash<QString, QDomElement>::iterator found = elements.find(prefix);
            if (found == elements.end()) {
                QDomElement element = document.createElement(levels.at(i));
                parent.appendChild(element);
                found = elements.insert(prefix, element);
            }
            parent = *found;
        }
        QDomElement leaf = document.createElement(levels.last());
        parent.appendChild(leaf);
        if (!elements.contains(key))
            elements.insert(key, leaf);
        leaf.appendChild(document.createTextNode(setting.value()));
    }

    root.setAttribute(QStringLiteral("version"), QStringLiteral("1.0"));
    root.setAttribute(QStringLiteral("modifydate"), moment.toLocalTime().toString(Qt::TextDate));
    root.setAttribute(QStringLiteral("modifydateInt"), QString::number(moment.toMSecsSinceEpoch() / 1000));
    return document.toString(1);
}

const QDateTime& fixedMoment()
{
    static const QDateTime moment(QDate(2024, 3, 1), QTime(12, 30, 0), Qt::UTC);
    return moment;
}

std::string rowName(const char* what, const std::string& shape, int count)
{
    return std::string("settings/") + what + "/" + shape + "/" + std::to_string(count);
}

void checkSameDocument(const std::string& shape, int count)
{
    const Zel_SettingList settings = makeSettings(shape, count);
    const QString expected = settings.toXML(QStringLiteral("Settings"), fixedMoment());
    const QString byHand = buildWithDom(settings, QStringLiteral("Settings"), fixedMoment());
    if (expected.isEmpty() || expected != byHand) {
        std::fprintf(stderr, "bench_settings_xml: the DOM by hand does not build toXML's document for %s/%d\n",
                     shape.c_str(), count);
        std::exit(2);
    }
}

void registerRows(const std::string& shape, int count)
{
    checkSameDocument(shape, count);
    const std::string feature = rowName("toXML", shape, count);
    const std::string peer = rowName("dom", shape, count);
    const benchmark::TimeUnit unit = count >= 10000 ? benchmark::kMillisecond : benchmark::kMicrosecond;

    zelbench::row(feature, count, [shape, count](benchmark::State& state) {
        const Zel_SettingList settings = makeSettings(shape, count);
        for (auto _ : state) {
            const QString xml = settings.toXML(QStringLiteral("Settings"), fixedMoment());
            benchmark::DoNotOptimize(xml.constData());
        }
    })->Unit(unit);
    zelbench::row(peer, count, [shape, count](benchmark::State& state) {
        const Zel_SettingList settings = makeSettings(shape, count);
        for (auto _ : state) {
            const QString xml = buildWithDom(settings, QStringLiteral("Settings"), fixedMoment());
            benchmark::DoNotOptimize(xml.constData());
        }
    })->Unit(unit);
    zelbench::target("settings XML " + shape + "/" + std::to_string(count) + " vs QDomDocument", feature, peer,
                     "peer", 0.5);
}

} // namespace

int main(int argc, char** argv)
{
    const int small = zelbench::size(1000, 100);
    const int medium = zelbench::size(10000, 300);
    const int large = zelbench::size(100000, 3000);
    registerRows("app", small);
    registerRows("app", large);
    registerRows("groups", medium);
    registerRows("groups", large);
    zelbench::target("settings XML growth, 10x the groups", rowName("toXML", "groups", large),
                     rowName("toXML", "groups", medium), "growth", 12.0, false);
    return zelbench::runMain(argc, argv, "settings XML");
}
