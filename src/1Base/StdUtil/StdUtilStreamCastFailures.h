/// What a failed cast ends in.
#ifndef QORN_1BASE_STDUTILSTREAMCASTFAILURES_H
#define QORN_1BASE_STDUTILSTREAMCASTFAILURES_H

namespace StdUtil {
namespace Detail {

/// Raises TExcStreamCast: a value of the type `source` could not be cast to `target`; both are the
/// raw names of the compiler. The other arguments say where, as of the caster's source. Kept out of
/// line, so that each of the many casts holds one call and its constant texts.
[[noreturn]] void throwStreamCastError(char const* file, unsigned int line, char const* func,
                                       char const* date, char const* time, char const* source,
                                       char const* target);

} // namespace Detail
} // namespace StdUtil

#endif
