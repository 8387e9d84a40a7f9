#include "1Base/StdUtil/StdUtilSingleton.h"

namespace StdUtil {

std::vector<Detail::CSingletonWrapperBase*>& CSingleton::getSingletons() {
    static std::vector<Detail::CSingletonWrapperBase*> singletons_;
    return singletons_;
}

} // namespace StdUtil
