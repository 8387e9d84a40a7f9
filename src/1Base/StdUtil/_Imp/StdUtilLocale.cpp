#include "1Base/StdUtil/StdUtilLocale.h"

#include <locale>

namespace StdUtil {

bool isGlobalLocaleClassic() {
    static std::locale const& classic = std::locale::classic();
    return std::locale() == classic;
}

} // namespace StdUtil
