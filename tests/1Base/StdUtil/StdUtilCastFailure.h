/// Sees what a failed cast hands over, whatever it ends in elsewhere.
#ifndef QORN_TESTS_STDUTILCASTFAILURE_H
#define QORN_TESTS_STDUTILCASTFAILURE_H

#include <string>

namespace StdUtilTest {

/// Thrown in place of the real failure: the arguments of throwStreamCastError.
struct CCastFailure {
    std::string file;
    unsigned int line;
    std::string func;
    std::string date;
    std::string time;
    std::string source;
    std::string target;
};

} // namespace StdUtilTest

#endif
