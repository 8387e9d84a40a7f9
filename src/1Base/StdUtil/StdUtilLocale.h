/// A question about the locale that new streams take on.
#ifndef QORN_1BASE_STDUTILLOCALE_H
#define QORN_1BASE_STDUTILLOCALE_H

namespace StdUtil {

/// True while the global C++ locale is the classic one, so that a new stream would neither group
/// digits nor write them in any other way of its own. Code that makes text without a stream asks
/// this at each call, and goes through the stream where the answer is no.
bool isGlobalLocaleClassic();

} // namespace StdUtil

#endif
