#include "sql_schema_p.h"

#include "sql_connection_p.h"
#include "sql_error_p.h"

namespace ZelSql {

QStringList commonSchemaStatements()
{
    return {
        QStringLiteral("CREATE INDEX nodes_by_mob_id ON nodes (mob_id) WHERE mob_id IS NOT NULL"),
        QStringLiteral("CREATE UNIQUE INDEX nodes_children_in_order ON nodes (parent_nid, position)"),
        QStringLiteral("CREATE TABLE node_properties ("
                       " nid BIGINT NOT NULL REFERENCES nodes (nid) ON DELETE CASCADE,"
                       " position BIGINT NOT NULL,"
                       " key TEXT NOT NULL,"
                       " value TEXT NOT NULL,"
                       " custom_values TEXT NOT NULL DEFAULT '',"
                       " PRIMARY KEY (nid, position))"),
        QStringLiteral("CREATE INDEX node_properties_by_key ON node_properties (nid, key)"),
        QStringLiteral("CREATE TABLE node_permissions ("
                       " nid BIGINT NOT NULL REFERENCES nodes (nid) ON DELETE CASCADE,"
                       " principal TEXT NOT NULL,"
                       " bits BIGINT NOT NULL,"
                       " PRIMARY KEY (nid, principal))"),
        QStringLiteral("CREATE TABLE node_markers ("
                       " nid BIGINT NOT NULL REFERENCES nodes (nid) ON DELETE CASCADE,"
                       " kind SMALLINT NOT NULL CHECK (kind IN (0, 1)),"
                       " position BIGINT NOT NULL,"
                       " marker_id TEXT NOT NULL,"
                       " PRIMARY KEY (nid, kind, position))"),
        QStringLiteral("CREATE TABLE marker_properties ("
                       " nid BIGINT NOT NULL,"
                       " kind SMALLINT NOT NULL,"
                       " marker_position BIGINT NOT NULL,"
                       " position BIGINT NOT NULL,"
                       " key TEXT NOT NULL,"
                       " value TEXT NOT NULL,"
                       " PRIMARY KEY (nid, kind, marker_position, position),"
                       " FOREIGN KEY (nid, kind, marker_position)"
                       "  REFERENCES node_markers (nid, kind, position) ON DELETE CASCADE ON UPDATE CASCADE)"),
        QStringLiteral("CREATE TABLE node_dependencies ("
                       " nid BIGINT NOT NULL REFERENCES nodes (nid) ON DELETE CASCADE,"
                       " position BIGINT NOT NULL,"
                       " moniker TEXT NOT NULL,"
                       " usage TEXT NOT NULL,"
                       " type BIGINT NOT NULL,"
                       " PRIMARY KEY (nid, position))"),
        QStringLiteral("CREATE TABLE node_media ("
                       " nid BIGINT NOT NULL REFERENCES nodes (nid) ON DELETE CASCADE,"
                       " position BIGINT NOT NULL,"
                       " path TEXT NOT NULL,"
                       " resolution TEXT NOT NULL,"
                       " PRIMARY KEY (nid, position))"),
        QStringLiteral("CREATE TABLE users ("
                       " name TEXT PRIMARY KEY,"
                       " password TEXT NOT NULL,"
                       " full_name TEXT NOT NULL,"
                       " admin BOOLEAN NOT NULL)"),
        QStringLiteral("CREATE TABLE property_keys ("
                       " key TEXT PRIMARY KEY,"
                       " position BIGINT NOT NULL UNIQUE,"
                       " display_name TEXT NOT NULL,"
                       " internal_name TEXT NOT NULL,"
                       " modifiable BOOLEAN NOT NULL,"
                       " available BOOLEAN NOT NULL,"
                       " type BIGINT NOT NULL,"
                       " text_searchable BOOLEAN NOT NULL,"
                       " has_custom_values BOOLEAN NOT NULL)"),
        QStringLiteral("CREATE TABLE resolutions ("
                       " position BIGINT PRIMARY KEY,"
                       " id TEXT NOT NULL UNIQUE,"
                       " label TEXT NOT NULL,"
                       " type BIGINT NOT NULL)"),
        QStringLiteral("CREATE TABLE application_settings ("
                       " application TEXT NOT NULL,"
                       " position BIGINT NOT NULL,"
                       " key TEXT NOT NULL,"
                       " value TEXT NOT NULL,"
                       " PRIMARY KEY (application, position))"),
        QStringLiteral("CREATE TABLE user_settings ("
                       " user_name TEXT NOT NULL,"
                       " settings_type SMALLINT NOT NULL,"
                       " position BIGINT NOT NULL,"
                       " key TEXT NOT NULL,"
                       " value TEXT NOT NULL,"
                       " PRIMARY KEY (user_name, settings_type, position))"),
        QStringLiteral("CREATE TABLE workgroup_settings ("
                       " position BIGINT PRIMARY KEY,"
                       " key TEXT NOT NULL,"
                       " value TEXT NOT NULL)"),
        QStringLiteral("CREATE TABLE documents ("
                       " name TEXT PRIMARY KEY,"
                       " content TEXT NOT NULL)"),
        QStringLiteral("CREATE TABLE linked_projects ("
                       " position BIGINT PRIMARY KEY,"
                       " moniker TEXT NOT NULL)"),
        QStringLiteral("CREATE TABLE counters ("
                       " name TEXT PRIMARY KEY,"
                       " value BIGINT NOT NULL)"),
        QStringLiteral("INSERT INTO counters (name, value) VALUES ('node_id', 0)"),
    };
}

SchemaPlan currentSchemaPlan(Connection& connection)
{
    SchemaPlan plan;
    plan.version = SchemaVersion;
    plan.create = connection.dialect().createSchema();
    // Steps from older versions are added here as the schema grows.
    return plan;
}

namespace {

const QString VersionKey = QStringLiteral("schema_version");

// The version in zel_meta; throws Damaged when it is missing or not a number.
int readVersion(Connection& connection)
{
    const QVariant value = connection.value(
        QStringLiteral("SELECT value FROM zel_meta WHERE key = ?"), {VersionKey});
    bool ok = false;
    const int version = value.toString().toInt(&ok);
    if (value.isNull() || !ok || version < 1) {
        throw StoreError(StoreError::Damaged,
                         QStringLiteral("%1: the store's table zel_meta holds no valid schema version (%2)")
                             .arg(connection.dialect().name(),
                                  value.isNull() ? QStringLiteral("none") : QLatin1Char('"') + value.toString() + QLatin1Char('"')));
    }
    return version;
}

// 0 for an empty database, the version of a zel store; throws Incompatible
// for a database of other tables.
int inspect(Connection& connection)
{
    const QStringList tables = connection.dialect().tables(connection);
    if (tables.contains(QLatin1String(MetaTable)))
        return readVersion(connection);
    if (tables.isEmpty())
        return 0;
    QStringList sorted = tables;
    sorted.sort();
    throw StoreError(StoreError::Incompatible,
                     QStringLiteral("%1: the database is not a zel store: it holds other tables (%2) and no zel_meta; nothing was changed")
                         .arg(connection.dialect().name(), sorted.join(QStringLiteral(", "))));
}

void refuseNewer(Connection& connection, int found, int known)
{
    throw StoreError(StoreError::Incompatible,
                     QStringLiteral("%1: the store has schema version %2, newer than this build of zel reads (up to %3); nothing was changed")
                         .arg(connection.dialect().name())
                         .arg(found)
                         .arg(known));
}

// Runs body inside a schema-change transaction; rolls back on any failure.
template <typename Body>
void inSchemaTransaction(Connection& connection, Body body)
{
    connection.dialect().beginSchemaChange(connection);
    try {
        body();
    } catch (...) {
        connection.rollback();
        throw;
    }
    connection.commit();
}

} // namespace

int storedSchemaVersion(Connection& connection)
{
    return connection.dialect().tables(connection).contains(QLatin1String(MetaTable)) ? readVersion(connection) : 0;
}

SchemaOutcome ensureSchema(Connection& connection, const SchemaPlan& plan)
{
    SchemaOutcome outcome;
    outcome.foundVersion = inspect(connection);
    outcome.version = outcome.foundVersion;
    if (outcome.foundVersion > plan.version)
        refuseNewer(connection, outcome.foundVersion, plan.version);
    if (outcome.foundVersion == plan.version)
        return outcome;

    // Another process may be creating or migrating at the same moment: look
    // again inside the transaction that holds the others off.
    if (outcome.foundVersion == 0) {
        inSchemaTransaction(connection, [&] {
            const int now = inspect(connection);
            if (now != 0) {
                outcome.version = now;
                return;
            }
            for (const QString& statement : plan.create)
                connection.exec(statement);
            connection.exec(QStringLiteral("INSERT INTO zel_meta (key, value) VALUES (?, ?)"),
                            {VersionKey, QString::number(plan.version)});
            outcome.version = plan.version;
            outcome.created = true;
        });
        if (outcome.version > plan.version)
            refuseNewer(connection, outcome.version, plan.version);
    }

    while (outcome.version < plan.version) {
        const int from = outcome.version;
        const MigrationStep* step = nullptr;
        for (const MigrationStep& candidate : plan.steps) {
            if (candidate.from == from)
                step = &candidate;
        }
        if (!step) {
            throw StoreError(StoreError::Incompatible,
                             QStringLiteral("%1: the store has schema version %2, which this build of zel cannot migrate to version %3")
                                 .arg(connection.dialect().name())
                                 .arg(from)
                                 .arg(plan.version));
        }
        try {
            inSchemaTransaction(connection, [&] {
                const int now = readVersion(connection);
                if (now != from) { // migrated by someone else meanwhile
                    outcome.version = now;
                    return;
                }
                step->apply(connection);
                connection.exec(QStringLiteral("UPDATE zel_meta SET value = ? WHERE key = ?"),
                                {QString::number(from + 1), VersionKey});
                outcome.version = from + 1;
            });
        } catch (const StoreError& error) {
            throw StoreError(error.kind(),
                             QStringLiteral("%1: migrating the store from schema version %2 to %3 failed; it keeps version %2: %4")
                                 .arg(connection.dialect().name())
                                 .arg(from)
                                 .arg(from + 1)
                                 .arg(error.message()),
                             error.nativeCode());
        }
        if (outcome.version > plan.version)
            refuseNewer(connection, outcome.version, plan.version);
    }
    return outcome;
}

} // namespace ZelSql
