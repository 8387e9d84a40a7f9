// The catalogue: one text a number, in English only. The wording is what callers see and compare,
// its oddities included: "(min. @(max))", the blank before ";", "dependent from".

#include "1Base/Error/ErrorMessage.h"

#include <map>

namespace Error {
namespace {

using TMessageMap = std::map<EMsgID, Strings::string>;

// Never destroyed: static objects of others may raise while the process ends.
TMessageMap const& defMsgMap() {
    static TMessageMap const& map = *new TMessageMap{
        {msgStdLibException, L"Standard library exception of type '@(CStdLibExceptionType)' "
                             L"caught.\nMessage: \"@(CStdLibExceptionWhat)\""},
        {msgAssertionFailed, L"Assertion failed in file @(file), line #@(line): \"@(expr)\""},
        {msgQuotedMessage, L"\"@(__msg__)\""},
        {msgPlainMessage, L"@(__msg__)"},
        {msgLoggingStarted, L"Logging started at @(time)"},
        {msgLoggingStopped, L"Logging stopped at @(time)"},
        {msgEnterScope, L"Entering scope \"@(name)\""},
        {msgLeaveScope, L"Leaving scope \"@(name)\""},
        {msgEnterFunction, L"Entering function '@(name)'"},
        {msgLeaveFunction, L"Leaving function '@(name)'"},
        {msgExceptionAdded, L"Exception @@(pExc) added to the exception registry."},
        {msgExceptionRemoved, L"Exception @@(pExc) removed from the exception registry."},
        {msgParams, L"@(param1)@(param2)@(param3)"},
        {msgAccessConflict, L"Access conflict"},
        {msgAccessConflictOn, L"Access conflict using @(type) @(key)"},
        {msgWrongArgument, L"Argument @(type) @(key) is wrong: @(reason)"},
        {msgMissingArgument, L"Argument @(type) is missing"},
        {msgBadStream, L"Bad stream"},
        {msgBadInputStream, L"Bad input stream"},
        {msgBadOutputStream, L"Bad output stream"},
        {msgCastFailed, L"Could not cast '@(source)' to '@(target)'"},
        {msgConcurrentUpdateOf, L"Concurrent update of @(type) @(key)"},
        {msgConcurrentUpdate, L"Concurrent update"},
        {msgCouldNot, L"Could not @(process) @(type) @(key): @(reason)"},
        {msgDependentExists, L"Dependent object(s) exist(s)"},
        {msgDependentMissing, L"Dependent object(s) do(es) not exist"},
        {msgDependentExistsOn, L"Object(s) dependent from @(type) @(key) exist(s)"},
        {msgDependentMissingOn, L"Dependent object(s) do(es) not exist for @(type) @(key)"},
        {msgDuplicate, L"Duplicate object exists"},
        {msgDuplicateOf, L"Duplicate object @(type) @(key) exists"},
        {msgEndOf, L"End of @(types)"},
        {msgResourceExhausted,
         L"Resource @(resource) exhausted. Needed: @(needed) ;available: @(available)!"},
        {msgInternalError, L"Internal error: @(error)"},
        {msgNoPermission, L"No permission to @(action)"},
        {msgNoPermissionOn, L"No permission to @(action) @(type) @(key)"},
        {msgNotExpected, L"@(type) @(key) was not expected"},
        {msgNotExpectedIn, L"@(type) @(key) was not expected in @(location)"},
        {msgNotFound, L"@(type) @(key) was not found"},
        {msgNotFoundIn, L"@(type) @(key) was not found in @(location)"},
        {msgNotImplemented, L"@(function) has not been implemented yet"},
        {msgNotPerformed, L"@(process) not performed due to above errors"},
        {msgNotPerformedOn, L"@(process) @(type) @(key) not performed due to above errors"},
        {msgSystemNotReady, L"The system is not ready: @(reason)."},
        {msgNotNow, L"Not now: @(reason)"},
        {msgOSCall, L"Error in OS call @(function): @(error)"},
        {msgOSCallArgs, L"Error in OS call @(function)(@(args)): @(error)"},
        {msgTooLarge, L"@(value) too large for @(type) (max. @(max))"},
        {msgTooSmall, L"@(value) too small for @(type) (min. @(max))"},
        {msgModuleError, L"@(module) @(error)"}};
    return map;
}

// Filled before anything can call in from outside, so that no failure has to do it.
[[maybe_unused]] TMessageMap const& filledAtStart = defMsgMap();

} // namespace

Strings::string loadDefaultMessage(EMsgID const& id) {
    auto const found = defMsgMap().find(id);
    return found == defMsgMap().end() ? Strings::string() : found->second;
}

} // namespace Error
