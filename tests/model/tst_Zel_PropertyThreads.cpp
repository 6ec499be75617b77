// The property manager registration used from several threads at once.
#include "Zel_Property.h"
#include "Zel_PropertyManager.h"

#include <QString>
#include <QStringList>
#include <boost/shared_ptr.hpp>

#include <gtest/gtest.h>

#include <atomic>
#include <thread>
#include <vector>

namespace {

// The registration is process-wide: the test starts and ends without one.
class Zel_PropertyThreadTest : public ::testing::Test
{
protected:
    void SetUp() override { Zel_Property::setPropertyManagerSP(boost::shared_ptr<Zel_PropertyManager>()); }
    void TearDown() override { Zel_Property::setPropertyManagerSP(boost::shared_ptr<Zel_PropertyManager>()); }
};

// Answers every name question with "<tag>:<argument>"; safe on any thread.
class ConstantManager : public Zel_PropertyManager
{
public:
    explicit ConstantManager(const QString& tag) : mTag(tag) {}
    QString getDisplayName(const QString& key) override { return mTag + QLatin1Char(':') + key; }
    bool getIsModifiable(const QString&) override { return false; }
    bool getIsAvailable(const QString&) override { return false; }
    QString getInternalName(const QString& key) override { return mTag + QLatin1Char(':') + key; }
    bool getIsType(Zel_PropertyKeyType, const QString&) override { return false; }
    bool getIsTextSearchable(const QString&) override { return false; }
    bool getHasCustomValues(const QString&) override { return true; }
    QStringList getKeys() override { return QStringList(); }
    QString getKeyByDisplayName(const QString& name) override { return mTag + QLatin1Char(':') + name; }

private:
    const QString mTag;
};

} // namespace

TEST_F(Zel_PropertyThreadTest, ThreadsRegisteringAndAskingSeeAWholeRegistration)
{
    // Sessions register and clear their managers on their own threads while
    // other threads ask questions; every answer comes from a manager that was
    // registered, or is the fallback. Run under ThreadSanitizer as well.
    constexpr int kRounds = 5000;
    std::atomic<int> writersLeft{2};
    std::atomic<long> answered{0};
    std::atomic<long> wrong{0};
    std::vector<std::thread> threads;
    for (int w = 0; w < 2; ++w) {
        threads.emplace_back([&, w] {
            const QString tag = QStringLiteral("w%1").arg(w);
            for (int round = 0; round < kRounds; ++round) {
                const boost::shared_ptr<Zel_PropertyManager> manager(new ConstantManager(tag));
                Zel_Property::setPropertyManagerSP(manager);
                std::this_thread::yield();
                if (round % 3 == 0)
                    Zel_Property::setPropertyManagerSP(boost::shared_ptr<Zel_PropertyManager>());
            } // each manager dies here: its registration reads as empty
            --writersLeft;
        });
    }
    const QString key = QStringLiteral("k");
    const QStringList valid = {QString(), QStringLiteral("w0:k"), QStringLiteral("w1:k")};
    for (int r = 0; r < 2; ++r) {
        threads.emplace_back([&] {
            while (writersLeft.load() > 0) {
                QString answer;
                if (const boost::shared_ptr<Zel_PropertyManager> m = Zel_Property::getPropertyManagerSP())
                    answer = m->getDisplayName(key);
                const QString viaStatic = Zel_Property::getDisplayName(key);
                const QString viaValue = Zel_Property(key, QString(), QString()).internalName();
                if (!valid.contains(answer) || !valid.contains(viaStatic) || !valid.contains(viaValue))
                    ++wrong;
                if (!answer.isEmpty())
                    ++answered;
            }
        });
    }
    for (std::thread& t : threads)
        t.join();

    EXPECT_EQ(wrong.load(), 0);
    EXPECT_GT(answered.load(), 0);
    EXPECT_FALSE(Zel_Property::getPropertyManagerSP()); // the last manager has died
}
