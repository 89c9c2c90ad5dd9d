// The status code of nearly every host and module operation; the numbers are part of the contract.
#pragma once

#include <iosfwd>

namespace Hsys {

enum ErrorStatus : int {
    eSuccess = 0,
    eNotImplemented = 1,
    eDoesNotApply = 2,
    eBadArgument = 3,
    eNothingFound = 5,
    eOutOfMemory = 6,
    eAlreadyPresent = 10,
    eNullPointer = 15,
    eNullId = 16,
    eNameNotFound = 22,
    eDuplicateName = 23,
    eInvalidIndex = 24,
    eInvalidDictionary = 32,
    eNoRecordForDatabase = 33,
    eWrongType = 34,
    eEndOfInput = 41,
    eNotOpenForRead = 44,
    eNotOpenForWrite = 45,
    eWrongClass = 46,
    eBadOldTdfItem = 51,
    eBadTdfSequence = 52,
    eAlreadyWritable = 83,
    eSelfReference = 97,
    eAuditFixedErrors = 120,
    eAuditErrorsNotFixed = 122,
    eAuditNoParent = 123,
    eInvalidProfile = 153,
    eStringTooLong = 160,
    eNewerVersion = 301,
    eNoDatabase = 506,

    // Host-only statuses: open conflicts, filers, drawing files. The module never names them.
    eWasOpenForRead = 1001,
    eWasOpenForWrite = 1002,
    eWasOpenForNotify = 1003,
    eWasErased = 1004,
    eNotInDatabase = 1005,
    eKeyNotFound = 1006,
    eFilerError = 1007,
    eFileNotFound = 1008,
    eFileAccessError = 1009,
    eBadDrawingFile = 1010,
    eNoTransaction = 1011,
    eInvalidInput = 1012,
};

// The enumerator's name, or "unknown status" for a number the enum does not hold.
const char* toString(ErrorStatus status);

// Prints "eWrongClass (46)", so that a failing test names the status.
std::ostream& operator<<(std::ostream& out, ErrorStatus status);

} // namespace Hsys
