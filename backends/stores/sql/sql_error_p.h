// Internal: the one error type of the SQL stores.
//
// Every failure of a store (opening it, reading or writing it, its schema)
// is thrown as a StoreError. Its kind says what the caller can do about it:
//   StoreUnavailable  the store cannot be reached or is busy now: the call
//                     may be retried later (the server down, the connection
//                     lost, a SQLite file locked past the busy timeout);
//   Conflict          the transaction lost a race with another one
//                     (serialization failure, deadlock): run the whole
//                     operation again in a fresh transaction;
//   OutcomeUnknown    the connection was lost during COMMIT: the change may
//                     or may not be stored; never retried blindly;
//   the constraint kinds: the database refused a change that breaks a rule
//                     (two siblings of one name, a reference to a node that
//                     is gone): answered with the rule's own error code;
//   BadUrl, LoginRefused, Incompatible, Damaged: opening failed and will fail
//                     again until someone changes the URL, the server's
//                     roles, or the file;
//   Internal          anything else.
// The message is complete in itself and names what was wrong (the file, the
// server, the role, the versions); it never contains a password.
#ifndef SQL_ERROR_P_H
#define SQL_ERROR_P_H

#include <QByteArray>
#include <QString>

#include <exception>

namespace ZelSql {

class StoreError : public std::exception
{
public:
    enum Kind {
        StoreUnavailable,
        Conflict,
        OutcomeUnknown,
        Internal,
        UniqueViolation,
        ForeignKeyViolation,
        NotNullViolation,
        CheckViolation,
        BadUrl,
        LoginRefused, // wrong password, unknown role, missing database
        Incompatible, // not a zel store, or a schema newer than this build
        Damaged       // not a database file, or a damaged one
    };

    StoreError(Kind kind, const QString& message, const QString& nativeCode = QString());

    Kind kind() const { return mKind; }
    const QString& message() const { return mMessage; }
    // The database's own code: the SQLSTATE for PostgreSQL, the result code
    // for SQLite; empty when the error did not come from the database.
    const QString& nativeCode() const { return mNativeCode; }
    const char* what() const noexcept override { return mWhat.constData(); }

    // Worth calling again later as it is (StoreUnavailable).
    bool retryCall() const { return mKind == StoreUnavailable; }
    // Worth running again in a fresh transaction (Conflict).
    bool retryTransaction() const { return mKind == Conflict; }
    // A database constraint refused the change.
    bool isConstraint() const
    {
        return mKind == UniqueViolation || mKind == ForeignKeyViolation || mKind == NotNullViolation
            || mKind == CheckViolation;
    }

    // The kind's name, for messages and tests ("StoreUnavailable", ...).
    static const char* kindName(Kind kind);

private:
    Kind mKind;
    QString mMessage;
    QString mNativeCode;
    QByteArray mWhat;
};

} // namespace ZelSql

#endif
