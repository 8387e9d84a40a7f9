/// Opens folders for listing, however long their paths are.
///
///     CDirReach reach;
///     DIR* const stream = reach.open(folder);
#ifndef QORN_2SYSTEM_FILESYSDIRREACH_H
#define QORN_2SYSTEM_FILESYSDIRREACH_H

#include <dirent.h>

#include <memory>
#include <string>

namespace FileSys {

/// The system takes paths of less than PATH_MAX bytes. Longer ones are opened in pieces, each from
/// the folder that the one before it names. The last of those folders stays open: the folders of a
/// walk mostly lie below the same one, and ten thousand in a row would be too many steps to be
/// taken from the start each time. Copies share it.
class CDirReach {
  public:
    /// Whether single calls can't take the path.
    static bool isTooLong(std::string const& path);

    /// Null, with errno set, where the folder can't be opened. A path that is too long ends in a
    /// name.
    DIR* open(std::string const& path);

  private:
    class CFolder_;

    DIR* openBelow_(std::string const& path);

    std::string path_; // of the folder that is open, with a separator behind it
    std::shared_ptr<CFolder_ const> folder_;
};

} // namespace FileSys

#endif
