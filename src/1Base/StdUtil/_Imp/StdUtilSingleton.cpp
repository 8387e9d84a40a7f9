#include "1Base/StdUtil/StdUtilSingleton.h"

namespace StdUtil {

std::vector<Detail::CSingletonWrapperBase*>& CSingleton::getSingletons() {
    // Never destroyed: the first call for a type may come while other static objects go.
    static auto& singletons_ = *new std::vector<Detail::CSingletonWrapperBase*>;
    return singletons_;
}

} // namespace StdUtil
