// Settings XML: Zel_SettingList::toXML over 1,000 and 100,000 settings,
// against the floor of building the same nested document by hand with
// QDomDocument and a QHash from key prefix to element, then toString(1).
//
// The settings look like an application's: four-level keys that share their
// upper levels ("App.Group12.Section3.Key7"), one flat key in fifty
// ("Recent40"), short values, some with characters XML escapes ("a < b & c").
// Before the rows run, the floor's text is checked to equal toXML's, so both
// rows build the same document.
//
// Rows:
//   settings/toXML/N         list.toXML("Settings", fixed moment)
//   settings/floor/N         the same document by hand, no name or character checks
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

namespace {

Zel_SettingList makeSettings(int count)
{
    Zel_SettingList list;
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

// The floor: the same document, built straight from the keys. Intermediate
// levels are found by their key prefix; the last level is always a new
// element (and, like toXML, is found as a parent by a longer key).
QString buildByHand(const Zel_SettingList& settings, const QString& rootName, const QDateTime& moment)
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

void checkSameDocument(int count)
{
    const Zel_SettingList settings = makeSettings(count);
    const QString expected = settings.toXML(QStringLiteral("Settings"), fixedMoment());
    const QString byHand = buildByHand(settings, QStringLiteral("Settings"), fixedMoment());
    if (expected.isEmpty() || expected != byHand) {
        std::fprintf(stderr, "bench_settings_xml: the floor does not build toXML's document for %d settings\n", count);
        std::exit(2);
    }
}

void registerRows(int count)
{
    const std::string feature = "settings/toXML/" + std::to_string(count);
    const std::string floor = "settings/floor/" + std::to_string(count);
    const benchmark::TimeUnit unit = count >= 10000 ? benchmark::kMillisecond : benchmark::kMicrosecond;

    zelbench::row(feature, count, [count](benchmark::State& state) {
        const Zel_SettingList settings = makeSettings(count);
        for (auto _ : state) {
            const QString xml = settings.toXML(QStringLiteral("Settings"), fixedMoment());
            benchmark::DoNotOptimize(xml.constData());
        }
    })->Unit(unit);
    zelbench::row(floor, count, [count](benchmark::State& state) {
        const Zel_SettingList settings = makeSettings(count);
        for (auto _ : state) {
            const QString xml = buildByHand(settings, QStringLiteral("Settings"), fixedMoment());
            benchmark::DoNotOptimize(xml.constData());
        }
    })->Unit(unit);
    zelbench::compare(feature, floor, "floor");
}

} // namespace

int main(int argc, char** argv)
{
    for (int count : {1000, 100000}) {
        checkSameDocument(count);
        registerRows(count);
    }
    return zelbench::runMain(argc, argv, "settings XML");
}
