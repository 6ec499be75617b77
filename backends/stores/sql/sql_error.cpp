#include "sql_error_p.h"

namespace ZelSql {

StoreError::StoreError(Kind kind, const QString& message, const QString& nativeCode)
    : mKind(kind), mMessage(message), mNativeCode(nativeCode), mWhat(message.toUtf8())
{
}

const char* StoreError::kindName(Kind kind)
{
    switch (kind) {
    case StoreUnavailable: return "StoreUnavailable";
    case Conflict: return "Conflict";
    case OutcomeUnknown: return "OutcomeUnknown";
    case Internal: return "Internal";
    case UniqueViolation: return "UniqueViolation";
    case ForeignKeyViolation: return "ForeignKeyViolation";
    case NotNullViolation: return "NotNullViolation";
    case CheckViolation: return "CheckViolation";
    case BadUrl: return "BadUrl";
    case LoginRefused: return "LoginRefused";
    case Incompatible: return "Incompatible";
    case Damaged: return "Damaged";
    }
    return "Internal";
}

} // namespace ZelSql
