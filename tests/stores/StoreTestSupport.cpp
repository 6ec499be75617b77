#include "StoreTestSupport.h"

#include "pg_connection_p.h"

namespace StoreTest {

void adminExec(const QString& sql)
{
    std::unique_ptr<ZelSql::Connection> admin = ZelSql::openPostgresqlConnection(ZelSql::parseStoreUrl(postgresqlUrl()));
    admin->exec(sql);
}

ScratchDatabase::ScratchDatabase()
{
    static std::atomic<int> counter{0};
    // The name is made here from numbers only; CREATE DATABASE takes no
    // bound values.
    mName = QStringLiteral("zel_test_%1_%2").arg(getpid()).arg(++counter);
    adminExec(QStringLiteral("CREATE DATABASE %1").arg(mName));
}

ScratchDatabase::~ScratchDatabase()
{
    try {
        adminExec(QStringLiteral("DROP DATABASE IF EXISTS %1 WITH (FORCE)").arg(mName));
    } catch (const std::exception& error) {
        ADD_FAILURE() << "could not drop " << str(mName) << ": " << error.what();
    }
}

QStringList sortedTables(ZelSql::Connection& connection)
{
    QStringList tables = connection.dialect().tables(connection);
    tables.sort();
    return tables;
}

QStringList expectedTables()
{
    return {QStringLiteral("application_settings"), QStringLiteral("change_journal"), QStringLiteral("counters"),
            QStringLiteral("documents"), QStringLiteral("linked_projects"), QStringLiteral("marker_properties"),
            QStringLiteral("node_dependencies"), QStringLiteral("node_markers"), QStringLiteral("node_media"),
            QStringLiteral("node_permissions"), QStringLiteral("node_properties"), QStringLiteral("nodes"),
            QStringLiteral("property_keys"), QStringLiteral("resolutions"), QStringLiteral("user_settings"),
            QStringLiteral("users"), QStringLiteral("workgroup_settings"), QStringLiteral("zel_meta")};
}

qint64 insertNode(ZelSql::Connection& connection, const QString& id, qint64 parentNid, const QString& name)
{
    const QVariant parent = parentNid ? QVariant(parentNid) : QVariant();
    const qint64 position = parentNid
        ? connection.value(QStringLiteral("SELECT COALESCE(MAX(position) + 1, 0) FROM nodes WHERE parent_nid = ?"), {parent}).toLongLong()
        : 0;
    connection.exec(QStringLiteral("INSERT INTO nodes (id, moniker, parent_nid, position, name, mime_type, created_ms, modified_ms)"
                                   " VALUES (?, ?, ?, ?, ?, ?, ?, ?)"),
                    {id, QStringLiteral("zel-mem://") + id, parent, position, name, QStringLiteral("folder"), qint64(0), qint64(0)});
    return connection.value(QStringLiteral("SELECT nid FROM nodes WHERE id = ?"), {id}).toLongLong();
}

qint64 count(ZelSql::Connection& connection, const QString& sql, const QVariantList& values)
{
    return connection.value(sql, values).toLongLong();
}

void expectSchemaRules(ZelSql::Connection& connection)
{
    using ZelSql::StoreError;
    const qint64 root = insertNode(connection, QStringLiteral("R"), 0, QStringLiteral("Root"));
    const qint64 project = insertNode(connection, QStringLiteral("P"), root, QStringLiteral("Project"));
    const qint64 bin = insertNode(connection, QStringLiteral("B"), project, QStringLiteral("Bin"));
    const qint64 clip = insertNode(connection, QStringLiteral("C"), bin, QStringLiteral("Clip"));
    insertNode(connection, QStringLiteral("Q"), root, QStringLiteral("Archive"));
    insertNode(connection, QStringLiteral("A"), root, QStringLiteral("Zebra"));
    for (int i = 0; i < 3; ++i) {
        connection.exec(QStringLiteral("INSERT INTO node_properties (nid, position, key, value) VALUES (?, ?, ?, ?)"),
                        {clip, i, QStringLiteral("Key %1").arg(i), QStringLiteral("v")});
    }
    connection.exec(QStringLiteral("INSERT INTO node_permissions (nid, principal, bits) VALUES (?, ?, ?)"),
                    {bin, QStringLiteral("*"), qint64(2048)});
    connection.exec(QStringLiteral("INSERT INTO node_markers (nid, kind, position, marker_id) VALUES (?, 0, 0, ?)"),
                    {clip, QStringLiteral("L1")});
    connection.exec(QStringLiteral("INSERT INTO marker_properties (nid, kind, marker_position, position, key, value)"
                                   " VALUES (?, 0, 0, 0, ?, ?)"),
                    {clip, QStringLiteral("Comment"), QStringLiteral("x")});

    // Children come back in the order they were added, not by name.
    QSqlQuery children = connection.exec(QStringLiteral("SELECT name FROM nodes WHERE parent_nid = ? ORDER BY position"), {root});
    QStringList names;
    while (children.next())
        names << children.value(0).toString();
    EXPECT_EQ((QStringList{QStringLiteral("Project"), QStringLiteral("Archive"), QStringLiteral("Zebra")}), names);

    // Two siblings of one name: refused; the same name elsewhere is fine.
    const StoreError twin = storeErrorOf([&] { insertNode(connection, QStringLiteral("P2"), root, QStringLiteral("Project")); });
    EXPECT_EQ(StoreError::UniqueViolation, twin.kind()) << twin.what();
    EXPECT_NO_THROW(insertNode(connection, QStringLiteral("B2"), bin, QStringLiteral("Project")));
    // A second node of one moniker, or a row of a node that does not exist.
    const StoreError sameId = storeErrorOf([&] { insertNode(connection, QStringLiteral("C"), root, QStringLiteral("Other")); });
    EXPECT_EQ(StoreError::UniqueViolation, sameId.kind()) << sameId.what();
    const StoreError orphan = storeErrorOf([&] {
        connection.exec(QStringLiteral("INSERT INTO node_properties (nid, position, key, value) VALUES (?, 0, 'k', 'v')"),
                        {qint64(987654)});
    });
    EXPECT_EQ(StoreError::ForeignKeyViolation, orphan.kind()) << orphan.what();
    const StoreError noName = storeErrorOf([&] {
        connection.exec(QStringLiteral("INSERT INTO users (name, password, full_name, admin) VALUES (?, ?, ?, ?)"),
                        {QStringLiteral("u"), QVariant(), QStringLiteral("U"), false});
    });
    EXPECT_EQ(StoreError::NotNullViolation, noName.kind()) << noName.what();
    const StoreError badKind = storeErrorOf([&] {
        connection.exec(QStringLiteral("INSERT INTO change_journal (kind, parent_moniker, child_moniker, origin, committed_ms)"
                                       " VALUES (?, 'p', 'c', 'o', 0)"),
                        {3});
    });
    EXPECT_EQ(StoreError::CheckViolation, badKind.kind()) << badKind.what();

    // Removing the project removes its subtree and everything hanging on it.
    connection.exec(QStringLiteral("DELETE FROM nodes WHERE nid = ?"), {project});
    EXPECT_EQ(0, count(connection, QStringLiteral("SELECT count(*) FROM nodes WHERE nid IN (?, ?, ?)"), {project, bin, clip}));
    EXPECT_EQ(0, count(connection, QStringLiteral("SELECT count(*) FROM node_properties")));
    EXPECT_EQ(0, count(connection, QStringLiteral("SELECT count(*) FROM node_permissions")));
    EXPECT_EQ(0, count(connection, QStringLiteral("SELECT count(*) FROM node_markers")));
    EXPECT_EQ(0, count(connection, QStringLiteral("SELECT count(*) FROM marker_properties")));
    EXPECT_EQ(3, count(connection, QStringLiteral("SELECT count(*) FROM nodes")));

    // The journal numbers its rows in the order they were written.
    for (int kind : {1, 4, 2}) {
        connection.exec(QStringLiteral("INSERT INTO change_journal (kind, parent_moniker, child_moniker, origin, committed_ms)"
                                       " VALUES (?, ?, ?, ?, ?)"),
                        {kind, QStringLiteral("zel-mem://R"), QStringLiteral("zel-mem://X"), QStringLiteral("test"), qint64(1)});
    }
    QSqlQuery journal = connection.exec(QStringLiteral("SELECT seq, kind FROM change_journal ORDER BY seq"));
    QList<int> kinds;
    qint64 previous = 0;
    while (journal.next()) {
        EXPECT_GT(journal.value(0).toLongLong(), previous);
        previous = journal.value(0).toLongLong();
        kinds << journal.value(1).toInt();
    }
    EXPECT_EQ((QList<int>{1, 4, 2}), kinds);
    EXPECT_EQ(0, count(connection, QStringLiteral("SELECT value FROM counters WHERE name = ?"), {QStringLiteral("node_id")}));
}

} // namespace StoreTest
