#include "StoreUnderTest.h"

#include "Zel_MemorySession.h"
#include "Zel_MemoryTree.h"

#include "memory_tree_p.h"

StoreUnderTest::~StoreUnderTest() = default;

namespace {

// The in-memory store: a Zel_MemoryTree.
class MemoryStore : public StoreUnderTest
{
public:
    explicit MemoryStore(const boost::shared_ptr<Zel_MemoryTree>& tree)
        : mTree(tree)
    {
    }

    boost::shared_ptr<Zel_MemorySession> newSession(Orv_Engine* engine, const QString& applicationName) override
    {
        return boost::shared_ptr<Zel_MemorySession>(new Zel_MemorySession(mTree, engine, applicationName));
    }
    QByteArray toJson() override { return mTree->toJson(); }
    int nodeCount() override { return mTree->nodeCount(); }
    QString monikerAt(const QString& path) override { return mTree->monikerAt(path); }
    ZelMemory::Store& records() override { return mTree->data(); }
    void setClock(std::function<QDateTime()> clock) override { records().setClock(std::move(clock)); }

private:
    boost::shared_ptr<Zel_MemoryTree> mTree;
};

} // namespace

std::vector<StoreKind> storeKinds()
{
    return {
        StoreKind{"Memory",
                  [](const QByteArray& json, QString* error) -> std::unique_ptr<StoreUnderTest> {
                      const boost::shared_ptr<Zel_MemoryTree> tree
                          = Zel_MemoryTree::fromJson(json, QStringLiteral("tree.json"), error);
                      if (!tree)
                          return nullptr;
                      return std::unique_ptr<StoreUnderTest>(new MemoryStore(tree));
                  }},
    };
}
