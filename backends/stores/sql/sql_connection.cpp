#include "sql_connection_p.h"

#include <atomic>
#include <utility>

namespace ZelSql {

Dialect::~Dialect() = default;

void Dialect::beforeJournalWrite(Connection&) const
{
}

namespace {
std::atomic<unsigned long long> connectionCounter{0};
}

Connection::Connection(const Dialect& dialect, const QString& driver)
    : mDialect(dialect),
      mName(QStringLiteral("zel-store-%1-%2").arg(driver).arg(++connectionCounter))
{
    if (!QSqlDatabase::isDriverAvailable(driver)) {
        throw StoreError(StoreError::Internal,
                         QStringLiteral("%1: the Qt SQL driver %2 is not installed").arg(dialect.name(), driver));
    }
    mDatabase = QSqlDatabase::addDatabase(driver, mName);
}

Connection::~Connection()
{
    mPrepared.clear();
    mFailed = QSqlQuery();
    mDatabase.close();
    // removeDatabase wants no QSqlDatabase of the name left anywhere.
    mDatabase = QSqlDatabase();
    QSqlDatabase::removeDatabase(mName);
}

QSqlQuery Connection::exec(const QString& sql, const QVariantList& values)
{
    QSqlQuery query(mDatabase);
    query.setForwardOnly(true);
    bool ok;
    if (values.isEmpty()) {
        ok = query.exec(sql);
    } else {
        ok = query.prepare(sql);
        if (ok) {
            for (const QVariant& value : values)
                query.addBindValue(value);
            ok = query.exec();
        }
    }
    if (!ok) {
        StoreError error = mDialect.mapError(query.lastError(), *this, sql, false);
        mFailed = std::move(query); // a copy where Qt has no move (Qt 5)
        throw error;
    }
    return query;
}

QSqlQuery& Connection::execPrepared(const QString& sql, const QVariantList& values)
{
    auto found = mPrepared.find(sql);
    if (found == mPrepared.end()) {
        QSqlQuery query(mDatabase);
        query.setForwardOnly(true);
        if (!query.prepare(sql))
            throw mDialect.mapError(query.lastError(), *this, sql, false);
        found = mPrepared.emplace(sql, query).first;
    }
    QSqlQuery& query = found->second;
    for (int i = 0; i < values.size(); ++i)
        query.bindValue(i, values.at(i));
    if (!query.exec())
        throw mDialect.mapError(query.lastError(), *this, sql, false);
    return query;
}

void Connection::checkRows(const QSqlQuery& query, const QString& sql)
{
    if (query.lastError().isValid())
        throw mDialect.mapError(query.lastError(), *this, sql, false);
}

QVariant Connection::value(const QString& sql, const QVariantList& values)
{
    QSqlQuery query = exec(sql, values);
    if (query.next())
        return query.value(0);
    checkRows(query, sql);
    return QVariant();
}

void Connection::commit()
{
    QSqlQuery query(mDatabase);
    if (!query.exec(QStringLiteral("COMMIT")))
        throw mDialect.mapError(query.lastError(), *this, QStringLiteral("COMMIT"), true);
}

void Connection::rollback() noexcept
{
    try {
        QSqlQuery query(mDatabase);
        query.exec(QStringLiteral("ROLLBACK"));
        mFailed = QSqlQuery();
    } catch (...) {
    }
}

} // namespace ZelSql
