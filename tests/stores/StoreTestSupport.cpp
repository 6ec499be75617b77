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

} // namespace StoreTest
