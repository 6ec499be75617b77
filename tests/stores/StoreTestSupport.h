// Helpers of the SQL store tests: expecting a StoreError of a kind and
// message, and scratch PostgreSQL databases on the test cluster.
#ifndef STORE_TEST_SUPPORT_H
#define STORE_TEST_SUPPORT_H

#include "sql_connection_p.h"
#include "sql_error_p.h"
#include "sql_url_p.h"

#include <QString>
#include <QStringList>

#include <gtest/gtest.h>

#include <atomic>
#include <unistd.h>

namespace StoreTest {

inline std::string str(const QString& text)
{
    return text.toStdString();
}

// Runs body and returns the StoreError it throws; fails the test when it
// throws nothing or something else.
template <typename Body>
ZelSql::StoreError storeErrorOf(Body body)
{
    try {
        body();
    } catch (const ZelSql::StoreError& error) {
        return error;
    } catch (const std::exception& other) {
        ADD_FAILURE() << "threw a std::exception that is no StoreError: " << other.what();
        return ZelSql::StoreError(ZelSql::StoreError::Internal, QStringLiteral("<not a StoreError>"));
    }
    ADD_FAILURE() << "threw nothing";
    return ZelSql::StoreError(ZelSql::StoreError::Internal, QStringLiteral("<nothing thrown>"));
}

#define EXPECT_STORE_ERROR(expectedKind, expectedMessage, statement)                                   \
    do {                                                                                                \
        const ZelSql::StoreError storeError_ = StoreTest::storeErrorOf([&] { statement; });           \
        EXPECT_STREQ(ZelSql::StoreError::kindName(expectedKind),                                       \
                     ZelSql::StoreError::kindName(storeError_.kind()))                                 \
            << storeError_.what();                                                                      \
        EXPECT_EQ(StoreTest::str(expectedMessage), StoreTest::str(storeError_.message()));              \
    } while (false)

// The test cluster's URL (scripts/with-postgresql.sh); empty when none.
inline QString postgresqlUrl()
{
    return QString::fromLocal8Bit(qgetenv("ZEL_TEST_POSTGRESQL_URL"));
}

#define SKIP_WITHOUT_POSTGRESQL()                                                                       \
    do {                                                                                                \
        if (StoreTest::postgresqlUrl().isEmpty())                                                       \
            GTEST_SKIP() << "no PostgreSQL server: ZEL_TEST_POSTGRESQL_URL is not set (run the tests "   \
                            "under scripts/with-postgresql.sh)";                                        \
    } while (false)

// The test URL with its database replaced by name.
inline ZelSql::StoreUrl urlOfDatabase(const QString& name)
{
    ZelSql::StoreUrl url = ZelSql::parseStoreUrl(postgresqlUrl());
    bool replaced = false;
    for (auto& parameter : url.parameters) {
        if (parameter.first == QLatin1String("dbname")) {
            parameter.second = name;
            replaced = true;
        }
    }
    if (!replaced)
        url.parameters.append(qMakePair(QStringLiteral("dbname"), name));
    return url;
}

// An empty database of its own for one test, dropped at the end.
class ScratchDatabase
{
public:
    ScratchDatabase();
    ~ScratchDatabase();
    const QString& name() const { return mName; }
    ZelSql::StoreUrl url() const { return urlOfDatabase(mName); }

private:
    QString mName;
};

// Runs one statement on the test cluster's own database (zel).
void adminExec(const QString& sql);

// --- Checks that hold for the schema in every dialect. ---

// The tables of a store, sorted.
QStringList sortedTables(ZelSql::Connection& connection);
// The tables this build creates, sorted.
QStringList expectedTables();
// Inserts a node row (position: the next among its siblings) and answers
// its nid; parentNid 0 makes a root.
qint64 insertNode(ZelSql::Connection& connection, const QString& id, qint64 parentNid, const QString& name);
qint64 count(ZelSql::Connection& connection, const QString& sql, const QVariantList& values = QVariantList());
// Unique sibling names, foreign keys, cascading subtree removal, children
// in order, and the journal's numbering, on a store just created.
void expectSchemaRules(ZelSql::Connection& connection);

} // namespace StoreTest

#endif
