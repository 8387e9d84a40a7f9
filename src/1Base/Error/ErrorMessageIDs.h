/// The numbers of the catalogue's messages. The texts stand in _Imp/ErrorMessageIDs.cpp.
#ifndef QORN_1BASE_ERRORMESSAGEIDS_H
#define QORN_1BASE_ERRORMESSAGEIDS_H

namespace Error {

/// Streamed as a number. The values are fixed, with none at 32: they show in placeholder texts.
enum EMsgID : int {
    msgStdLibException = 0, ///< wraps an exception of the standard library
    msgAssertionFailed = 1, ///< the report of a failed assertion
    msgQuotedMessage = 2,   ///< a given text in quotes
    msgPlainMessage = 3,    ///< a given text as it is
    msgLoggingStarted = 4,
    msgLoggingStopped = 5,
    msgEnterScope = 6,
    msgLeaveScope = 7,
    msgEnterFunction = 8,
    msgLeaveFunction = 9,
    msgExceptionAdded = 10, ///< the exception registry's lines, for an observer that logs
    msgExceptionRemoved = 11,
    msgParams = 12,         ///< up to three parameters in a row
    msgAccessConflict = 13, // from here on, a general vocabulary of failures
    msgAccessConflictOn = 14,
    msgWrongArgument = 15,
    msgMissingArgument = 16,
    msgBadStream = 17,
    msgBadInputStream = 18,
    msgBadOutputStream = 19,
    msgCastFailed = 20,
    msgConcurrentUpdateOf = 21,
    msgConcurrentUpdate = 22,
    msgCouldNot = 23,
    msgDependentExists = 24,
    msgDependentMissing = 25,
    msgDependentExistsOn = 26,
    msgDependentMissingOn = 27,
    msgDuplicate = 28,
    msgDuplicateOf = 29,
    msgEndOf = 30,
    msgResourceExhausted = 31,
    msgInternalError = 33,
    msgNoPermission = 34,
    msgNoPermissionOn = 35,
    msgNotExpected = 36,
    msgNotExpectedIn = 37,
    msgNotFound = 38,
    msgNotFoundIn = 39,
    msgNotImplemented = 40,
    msgNotPerformed = 41,
    msgNotPerformedOn = 42,
    msgSystemNotReady = 43,
    msgNotNow = 44,
    msgOSCall = 45,
    msgOSCallArgs = 46,
    msgTooLarge = 47,
    msgTooSmall = 48,
    msgModuleError = 49
};

} // namespace Error

#endif
