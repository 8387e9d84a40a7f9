#include "2System/FileSys/FileSysStatusHook.h"

#include <boost/filesystem/operations.hpp>

#include <utility>

std::function<void()> askInstead;

boost::filesystem::file_status
realStatus(boost::filesystem::path const& path,
           boost::system::error_code* error) __asm__("__real_" STATUS_FUNCTION);
boost::filesystem::file_status
wrapStatus(boost::filesystem::path const& path,
           boost::system::error_code* error) __asm__("__wrap_" STATUS_FUNCTION);

boost::filesystem::file_status wrapStatus(boost::filesystem::path const& path,
                                          boost::system::error_code* error) {
    if (error == nullptr)
        if (std::function<void()> const instead = std::exchange(askInstead, nullptr))
            instead();
    return realStatus(path, error);
}
