// Settings XML under a German system locale: the "modifydate" attribute uses
// the system locale's short day and month names, in the Qt 5 and the Qt 6
// build alike. This program runs with LC_ALL=de_DE.UTF-8 (tests/CMakeLists.txt);
// scripts/deps.sh generates that locale.
#include "Zel_SettingList.h"

#include <QDate>
#include <QDateTime>
#include <QDomDocument>
#include <QDomElement>
#include <QLocale>
#include <QTime>

#include <gtest/gtest.h>

#include <clocale>
#include <string>

namespace {

QDomElement parsedRoot(const QString& xml)
{
    QDomDocument document;
    EXPECT_TRUE(document.setContent(xml)) << xml.toStdString();
    return document.documentElement();
}

std::string modifyDate(const QDateTime& moment)
{
    Zel_SettingList list;
    list.append(Zel_Setting("k", "v"));
    return parsedRoot(list.toXML("R", moment)).attribute("modifydate").toStdString();
}

// German short names (Qt's locale data for de_DE), Monday first.
const char* const kDays[] = {"Mo.", "Di.", "Mi.", "Do.", "Fr.", "Sa.", "So."};
const char* const kMonths[] = {"Jan.", "Feb.", "März", "Apr.", "Mai", "Juni",
                               "Juli", "Aug.", "Sept.", "Okt.", "Nov.", "Dez."};

} // namespace

TEST(Zel_SettingListLocaleTest, ModifyDateUsesTheSystemLocalesShortDayAndMonthNames)
{
    ASSERT_NE(std::setlocale(LC_ALL, ""), nullptr)
        << "the system locale of this test, de_DE.UTF-8, is not installed: run scripts/deps.sh";
    ASSERT_EQ(QLocale::system().name().toStdString(), "de_DE") << "this test must run with LC_ALL=de_DE.UTF-8";

    // Fixed local moments: day name, month name, day, time, year.
    EXPECT_EQ(modifyDate(QDateTime(QDate(2024, 3, 5), QTime(14, 7, 9))), "Di. März 5 14:07:09 2024");
    EXPECT_EQ(modifyDate(QDateTime(QDate(2001, 9, 9), QTime(3, 46, 40))), "So. Sept. 9 03:46:40 2001");
    EXPECT_EQ(modifyDate(QDateTime(QDate(1999, 12, 31), QTime(23, 59, 59))), "Fr. Dez. 31 23:59:59 1999");
    EXPECT_EQ(modifyDate(QDateTime(QDate(2018, 1, 1), QTime(0, 0, 0))), "Mo. Jan. 1 00:00:00 2018");

    // The current moment: the names match the moment that modifydateInt gives.
    const QDomElement root = parsedRoot(Zel_SettingList().toXML("Settings"));
    const QDateTime stamped = QDateTime::fromSecsSinceEpoch(root.attribute("modifydateInt").toLongLong()).toLocalTime();
    const QDate date = stamped.date();
    const std::string expected = std::string(kDays[date.dayOfWeek() - 1]) + " " + kMonths[date.month() - 1] + " "
        + std::to_string(date.day()) + " " + stamped.time().toString(QStringLiteral("hh:mm:ss")).toStdString() + " "
        + std::to_string(date.year());
    EXPECT_EQ(root.attribute("modifydate").toStdString(), expected);
}
