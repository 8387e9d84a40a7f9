/// The entries of one folder in the order in which the system lists them.
///
///     for (CDirListing listing(folder); listing.next();)
///         use(listing.name(), listing.type());
#ifndef QORN_2SYSTEM_FILESYSDIRLISTING_H
#define QORN_2SYSTEM_FILESYSDIRLISTING_H

#include <boost/filesystem/file_status.hpp>

#include <dirent.h>

#include <memory>
#include <string>

namespace FileSys {

/// Boost's own iterator keeps the types that the system lists to itself and asks the disk again for
/// each entry, which costs more than all the rest of a walk.
class CDirListing {
  public:
    /// Raises std::system_error where the folder can't be opened.
    explicit CDirListing(std::string const& folder);

    /// Moves to the next entry but for "." and "..", and says whether there is one. Raises
    /// std::system_error where the system can't tell.
    bool next();

    /// Of the entry that next() moved to, and valid until the next call.
    char const* name() const { return entry_->d_name; }

    /// What the entry is; status_error where the system doesn't list that, or it is a link.
    boost::filesystem::file_type type() const;

  private:
    struct CCloser {
        void operator()(DIR* stream) const { closedir(stream); }
    };

    std::unique_ptr<DIR, CCloser> stream_;
    dirent const* entry_ = nullptr;
};

} // namespace FileSys

#endif
