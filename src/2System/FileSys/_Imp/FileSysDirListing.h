/// The entries of one folder in the order in which the system lists them.
///
///     CDirReach reach;
///     for (CDirListing listing(folder, 0, reach); listing.next();)
///         use(listing.name(), listing.kind());
#ifndef QORN_2SYSTEM_FILESYSDIRLISTING_H
#define QORN_2SYSTEM_FILESYSDIRLISTING_H

#include "2System/FileSys/_Imp/FileSysDirReach.h"

#include <boost/filesystem/file_status.hpp>

#include <dirent.h>

#include <memory>
#include <string>

namespace FileSys {

/// Boost's own iterator keeps the types that the system lists to itself and asks the disk again for
/// each entry, which costs more than all the rest of a walk. Nor does it open what CDirReach does.
class CDirListing {
  public:
    /// `links` is the number of links that the walk has followed down to the folder. Raises
    /// std::system_error where the folder can't be opened.
    CDirListing(std::string const& folder, unsigned int links, CDirReach& reach);

    /// Moves to the next entry but for "." and "..", and says whether there is one. Raises
    /// std::system_error where the system can't tell.
    bool next();

    /// Of the entry that next() moved to, and valid until the next call.
    char const* name() const { return entry_->d_name; }

    /// What an entry is, or leads to. `type` is status_error where the system doesn't list that.
    struct SKind {
        boost::filesystem::file_type type;
        bool isLink;
    };

    /// As the system lists the entry that next() moved to; a link's target is not listed.
    SKind kind() const;

    /// Asks the disk about an entry of the folder by its path, for what its listed kind leaves
    /// open. Raises an exception of the standard library where the disk can't tell.
    SKind askKind(std::string const& path, SKind const& listed) const;

  private:
    struct CCloser {
        void operator()(DIR* stream) const { closedir(stream); }
    };

    SKind askKindByName_(char const* name) const;

    std::unique_ptr<DIR, CCloser> stream_;
    dirent const* entry_ = nullptr;
    unsigned int links_;
};

} // namespace FileSys

#endif
