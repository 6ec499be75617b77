// Internal: the schema of the SQL stores, its version and its migrations.
//
// The tables (the same in SQLite and PostgreSQL but for key and serial
// columns, which each dialect declares itself):
//   zel_meta           key/value rows; "schema_version" is the schema's version
//   nodes              one row per node: ID, moniker, parent, position among
//                      its siblings, name, mime type, master moniker, media
//                      object ID, the reservation, times; UNIQUE(parent, name);
//                      removing a node removes its subtree (ON DELETE CASCADE)
//   node_properties    the stored properties of a node, in order
//   node_permissions   per node: user (or "*") -> permission bits
//   node_markers       frame locators (kind 0) and restrictions (kind 1), in order
//   marker_properties  the properties of each marker, in order
//   node_dependencies  per node, in order: moniker, usage, type
//   node_media         per node, in order: media file path, resolution ID
//   users, property_keys, resolutions
//   application_settings, user_settings, workgroup_settings, documents
//   linked_projects    monikers, in order
//   counters           named serial numbers ("node_id": the last node ID made)
//   change_journal     every committed change, numbered in commit order: kind
//                      (1 added, 2 removed, 4 updated, the event type codes),
//                      parent and child moniker, the session that made it
// Times are milliseconds since 1970-01-01 UTC; positions start at 0.
//
// ensureSchema creates the schema in an empty database in one transaction,
// migrates an older one a version at a time (each step one transaction), and
// refuses, changing nothing, a database that is not a zel store or whose
// schema is newer than this build knows.
#ifndef SQL_SCHEMA_P_H
#define SQL_SCHEMA_P_H

#include <QString>
#include <QStringList>

#include <functional>
#include <vector>

namespace ZelSql {

class Connection;

// The schema version this build creates and reads.
const int SchemaVersion = 1;

// The table that marks a database as a zel store.
const char* const MetaTable = "zel_meta";

// The statements that make the tables common to both dialects, in order;
// they follow the dialect's nodes table and precede its change_journal.
QStringList commonSchemaStatements();

// One migration: from version `from` to `from + 1`, run inside the
// transaction that also records the new version.
struct MigrationStep {
    int from;
    std::function<void(Connection&)> apply;
};

// What ensureSchema builds: the version, the statements that create it in
// an empty database, and the steps that bring older versions up to it.
struct SchemaPlan {
    int version = SchemaVersion;
    QStringList create;
    std::vector<MigrationStep> steps;
};

// The plan of this build for the connection's dialect.
SchemaPlan currentSchemaPlan(Connection& connection);

struct SchemaOutcome {
    int foundVersion = 0; // 0: the database was empty
    int version = 0;      // the version now
    bool created = false;
};

// Creates or migrates the schema as described above; throws StoreError
// (Incompatible for a foreign database or a newer schema, Damaged for a
// zel_meta without a readable version, the failing statement's error
// otherwise) and leaves the database as it was.
SchemaOutcome ensureSchema(Connection& connection, const SchemaPlan& plan);

// The version recorded in zel_meta; 0 when the database has no zel_meta.
int storedSchemaVersion(Connection& connection);

} // namespace ZelSql

#endif
