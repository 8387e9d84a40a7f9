/// Stands in front of the path library's questions that may raise, those without an error code.
///
///     askInstead = [] { ERROR_THROW(FileSys::TExcFileSysOp, Error::msgAccessConflict); };
///     FileSys::createFolder(path);   // raises that
///
/// The program puts the wrapper of FileSysStatusHook.cpp in the place of the function that
/// STATUS_FUNCTION names.
#ifndef QORN_TESTS_FILESYSSTATUSHOOK_H
#define QORN_TESTS_FILESYSSTATUSHOOK_H

#include <functional>

/// Called once, in front of the next such question; empty from then on.
extern std::function<void()> askInstead;

#endif
