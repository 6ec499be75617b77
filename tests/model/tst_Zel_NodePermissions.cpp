#include "Zel_NodePermissions.h"

#include "VtableSlot.h"

#include <QStringList>

#include <gtest/gtest.h>

#include <array>
#include <vector>

namespace {

using Setter = void (Zel_NodePermissions::*)(const bool&);
using Getter = const bool& (Zel_NodePermissions::*)() const;

struct Flag
{
    const char* name;
    Setter set;
    Getter get;
};

#define FLAG(Name) {#Name, &Zel_NodePermissions::set##Name, &Zel_NodePermissions::get##Name}

// Declaration order.
const std::vector<Flag>& flags()
{
    static const std::vector<Flag> all = {
        FLAG(IsOwner), FLAG(IsAdmin), FLAG(HasSendToPlayback), FLAG(HasReadAllLogs),
        FLAG(HasUseHighResolution), FLAG(HasUseLowResolution), FLAG(HasArchiveRestore),
        FLAG(HasUserAttributeManagement), FLAG(HasCanCreateColumns), FLAG(HasCanModifyColumns),
        FLAG(HasCanModifyPropertiesInAccess), FLAG(HasRead), FLAG(HasCopy), FLAG(HasAddFiles),
        FLAG(HasAddFolders), FLAG(HasWriteAttributes), FLAG(HasWriteUserAttributes),
        FLAG(HasWriteNewVersions), FLAG(HasCanWriteLocators), FLAG(HasCanWriteDRMs),
        FLAG(HasDeleteAssets), FLAG(HasDestroyAssets), FLAG(HasDestroyMedia), FLAG(HasReserve),
        FLAG(HasOverrideReservation), FLAG(HasPermissionsManagement), FLAG(HasCanCreateLocators),
        FLAG(HasCanModifyLocators), FLAG(HasCanCreateRestrictions), FLAG(HasCanModifyRestrictions),
    };
    return all;
}

#undef FLAG

// The expected rendering when exactly the flags in `set` are true: IsAdmin
// (declaration index 1) first, then IsOwner (0), then the rest in order, each
// token upper case when set.
QString expectedRendering(const std::array<bool, 30>& set, const QString& moniker)
{
    static const QStringList rest = QStringLiteral("stp ral hr lr ar uam cc mc mpa r c fi fo wa wua wnv wl wd dela desa "
                                                   "desm res ovres pm cl ml cr mr").split(QLatin1Char(' '));
    QString text = QLatin1String(set[1] ? "{A " : "{ a ") + QLatin1String(set[0] ? "O " : "o ");
    for (int i = 2; i < 30; ++i)
        text += (set[i] ? rest[i - 2].toUpper() : rest[i - 2]) + QLatin1Char(' ');
    return text + QStringLiteral("} ") + moniker;
}

Zel_NodePermissions construct(boost::shared_ptr<QString> moniker, const std::array<bool, 30>& f)
{
    return Zel_NodePermissions(moniker, f[0], f[1], f[2], f[3], f[4], f[5], f[6], f[7], f[8], f[9], f[10],
                               f[11], f[12], f[13], f[14], f[15], f[16], f[17], f[18], f[19], f[20], f[21],
                               f[22], f[23], f[24], f[25], f[26], f[27], f[28], f[29]);
}

boost::shared_ptr<QString> moniker(const char* text)
{
    return boost::shared_ptr<QString>(new QString(QLatin1String(text)));
}

} // namespace

TEST(Zel_NodePermissionsTest, AccessorsOccupyTheirVirtualSlotsInFlagOrder)
{
    EXPECT_EQ(2, vtableSlot(&Zel_NodePermissions::setMoniker));
    EXPECT_EQ(3, vtableSlot(&Zel_NodePermissions::getMoniker));
    ASSERT_EQ(30u, flags().size());
    for (std::size_t i = 0; i < flags().size(); ++i) {
        SCOPED_TRACE(flags()[i].name);
        EXPECT_EQ(static_cast<std::ptrdiff_t>(4 + 2 * i), vtableSlot(flags()[i].set));
        EXPECT_EQ(static_cast<std::ptrdiff_t>(5 + 2 * i), vtableSlot(flags()[i].get));
    }
    EXPECT_EQ(-1, vtableSlot(&Zel_NodePermissions::toZelString));
}

TEST(Zel_NodePermissionsTest, RendersAllFalseAndAllTrueExactly)
{
    std::array<bool, 30> none{};
    std::array<bool, 30> all;
    all.fill(true);

    EXPECT_EQ(QStringLiteral("{ a o stp ral hr lr ar uam cc mc mpa r c fi fo wa wua wnv wl wd dela desa desm "
                             "res ovres pm cl ml cr mr } m"),
              construct(moniker("m"), none).toZelString());
    EXPECT_EQ(QStringLiteral("{A O STP RAL HR LR AR UAM CC MC MPA R C FI FO WA WUA WNV WL WD DELA DESA DESM "
                             "RES OVRES PM CL ML CR MR } m"),
              construct(moniker("m"), all).toZelString());
    // The default constructor clears every flag as well.
    Zel_NodePermissions defaults;
    defaults.setMoniker(moniker("m"));
    EXPECT_EQ(construct(moniker("m"), none).toZelString(), defaults.toZelString());
}

TEST(Zel_NodePermissionsTest, ConstructorAndSettersReachEachFlagAndItsToken)
{
    for (std::size_t i = 0; i < 30; ++i) {
        SCOPED_TRACE(flags()[i].name);
        std::array<bool, 30> one{};
        one[i] = true;

        const Zel_NodePermissions built = construct(moniker("n"), one);
        for (std::size_t j = 0; j < 30; ++j)
            EXPECT_EQ(i == j, (built.*flags()[j].get)()) << flags()[j].name;
        EXPECT_EQ(expectedRendering(one, QStringLiteral("n")), built.toZelString());

        Zel_NodePermissions set;
        set.setMoniker(moniker("n"));
        (set.*flags()[i].set)(true);
        EXPECT_EQ(built.toZelString(), set.toZelString());
        (set.*flags()[i].set)(false);
        EXPECT_FALSE((set.*flags()[i].get)());
    }
}

TEST(Zel_NodePermissionsTest, EmptyMonikerTextAndEmptyPointerBothEndWithTheBlank)
{
    Zel_NodePermissions emptyText;
    emptyText.setMoniker(moniker(""));
    Zel_NodePermissions noPointer; // default: empty moniker pointer
    EXPECT_FALSE(noPointer.getMoniker());
    EXPECT_EQ(expectedRendering({}, QString()), emptyText.toZelString());
    EXPECT_EQ(emptyText.toZelString(), noPointer.toZelString());

    noPointer.setIsOwner(true);
    noPointer.setMoniker(boost::shared_ptr<QString>());
    EXPECT_EQ(expectedRendering({true}, QString()), noPointer.toZelString());
}

TEST(Zel_NodePermissionsTest, CopiesShareTheMonikerAndCopyEveryFlag)
{
    std::array<bool, 30> some{};
    some[3] = some[17] = some[29] = true;
    const boost::shared_ptr<QString> name = moniker("node");
    const Zel_NodePermissions original = construct(name, some);

    Zel_NodePermissions copy(original);
    EXPECT_EQ(name.get(), copy.getMoniker().get());

    Zel_NodePermissions assigned;
    assigned.setHasRead(true);
    assigned = original;
    EXPECT_EQ(name.get(), assigned.getMoniker().get());
    EXPECT_FALSE(assigned.getHasRead());

    // The text object is shared: a change through it shows in every copy.
    *name = QStringLiteral("renamed");
    EXPECT_EQ(expectedRendering(some, QStringLiteral("renamed")), copy.toZelString());
    EXPECT_EQ(copy.toZelString(), assigned.toZelString());

    const Zel_NodePermissions& self = assigned;
    assigned = self;
    EXPECT_EQ(original.toZelString(), assigned.toZelString());
}
