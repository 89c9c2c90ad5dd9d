#include "platform/host/ut/HsysErrorStatus.h"

#include <ostream>

namespace Hsys {

const char* toString(ErrorStatus status) {
    switch (status) {
    case eSuccess: return "eSuccess";
    case eNotImplemented: return "eNotImplemented";
    case eDoesNotApply: return "eDoesNotApply";
    case eBadArgument: return "eBadArgument";
    case eNothingFound: return "eNothingFound";
    case eOutOfMemory: return "eOutOfMemory";
    case eAlreadyPresent: return "eAlreadyPresent";
    case eNullPointer: return "eNullPointer";
    case eNullId: return "eNullId";
    case eNameNotFound: return "eNameNotFound";
    case eDuplicateName: return "eDuplicateName";
    case eInvalidIndex: return "eInvalidIndex";
    case eInvalidDictionary: return "eInvalidDictionary";
    case eNoRecordForDatabase: return "eNoRecordForDatabase";
    case eWrongType: return "eWrongType";
    case eEndOfInput: return "eEndOfInput";
    case eNotOpenForRead: return "eNotOpenForRead";
    case eNotOpenForWrite: return "eNotOpenForWrite";
    case eWrongClass: return "eWrongClass";
    case eBadOldTdfItem: return "eBadOldTdfItem";
    case eBadTdfSequence: return "eBadTdfSequence";
    case eAlreadyWritable: return "eAlreadyWritable";
    case eSelfReference: return "eSelfReference";
    case eAuditFixedErrors: return "eAuditFixedErrors";
    case eAuditErrorsNotFixed: return "eAuditErrorsNotFixed";
    case eAuditNoParent: return "eAuditNoParent";
    case eInvalidProfile: return "eInvalidProfile";
    case eStringTooLong: return "eStringTooLong";
    case eNewerVersion: return "eNewerVersion";
    case eNoDatabase: return "eNoDatabase";
    case eWasOpenForRead: return "eWasOpenForRead";
    case eWasOpenForWrite: return "eWasOpenForWrite";
    case eWasOpenForNotify: return "eWasOpenForNotify";
    case eWasErased: return "eWasErased";
    case eNotInDatabase: return "eNotInDatabase";
    case eKeyNotFound: return "eKeyNotFound";
    case eFilerError: return "eFilerError";
    case eFileNotFound: return "eFileNotFound";
    case eFileAccessError: return "eFileAccessError";
    case eBadDrawingFile: return "eBadDrawingFile";
    case eNoTransaction: return "eNoTransaction";
    case eInvalidInput: return "eInvalidInput";
    }
    return "unknown status";
}

std::ostream& operator<<(std::ostream& out, ErrorStatus status) {
    return out << toString(status) << " (" << static_cast<int>(status) << ")";
}

} // namespace Hsys
