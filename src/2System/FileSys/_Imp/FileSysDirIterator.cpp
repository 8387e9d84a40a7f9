#include "2System/FileSys/FileSysDirIterator.h"

#include "1Base/Encoding/EncodingConverter.h"
#include "2System/FileSys/_Imp/FileSysDirListing.h"
#include "2System/FileSys/_Imp/FileSysDirSiblings.h"

#include <boost/filesystem/file_status.hpp>
#include <boost/filesystem/path.hpp>

#include <deque>
#include <exception>
#include <string>
#include <string_view>
#include <utility>

namespace FileSys {
namespace {

// Entries of one folder that are all of one kind.
struct SWaiting {
    CDirSiblings entries;
    bool areFolders;
};

// What the paths of a folder's entries begin with.
std::string prefixOf(std::string const& folder) {
    return folder.back() == '/' ? folder : folder + '/';
}

} // namespace

class CDirIterator::Impl_ {
  public:
    Impl_(CFileSpec const& root, Strings::string const& extension, unsigned int flags,
          ERecursive recursive)
        : root_(root),
          extension_(extension),
          dottedExtension_(CFileSpec::getExtensionSeparator() + extension),
          flags_(flags),
          recursive_(recursive) {
        if (root_.exists())
            scan_(root_.getFullName<std::string>(true));
    }

    std::unique_ptr<Impl_> clone() const { return std::make_unique<Impl_>(*this); }

    bool empty() const { return pending_.empty(); }

    // The front entry as a specification.
    void setCurrent(CFileSpec& current) { pending_.front().entries.getFileSpec(current); }

    // False at the end.
    bool next() {
        if (pending_.empty())
            return false;
        leaveFront_();
        return fetch_first_consumable_();
    }

  private:
    // Folders are listed and fetched from in one loop: if each listing fetched the next entry by
    // itself, a long row of empty folders would take a frame of the stack each.
    bool scan_(std::string const& folder) {
        list_(folder, 0);
        return fetch_first_consumable_();
    }

    bool fetch_first_consumable_() {
        while (!pending_.empty() && !isConsumable_(pending_.front()))
            leaveFront_();
        return !pending_.empty();
    }

    void leaveFront_() {
        SWaiting const& front = pending_.front();
        if (recursive_ != eRecursive || !front.areFolders) {
            dropFront_();
            return;
        }
        std::string const folder = front.entries.path();
        unsigned int const links = front.entries.links();
        dropFront_();
        list_(folder, links);
    }

    void dropFront_() {
        CDirSiblings& entries = pending_.front().entries;
        entries.pop();
        if (entries.empty())
            pending_.pop_front();
    }

    // Files passed the filter when they were listed.
    bool isConsumable_(SWaiting const& front) const {
        if (delivers_(eFolders) && front.areFolders)
            return extension_.empty() || entry_matches_extension_(front.entries.name());
        return delivers_(eFiles) && !front.areFolders;
    }

    void list_(std::string const& folder, unsigned int links) {
        std::string const prefix = prefixOf(folder);
        SWaiting files = {CDirSiblings(prefix, links), false};
        SWaiting folders = {CDirSiblings(prefix, links), true};
        try {
            read_(CDirListing(folder, links, reach_), prefix, files.entries, folders.entries);
        } catch (std::exception const&) {
            // What was found before a failure counts.
        }
        files.entries.sort();
        folders.entries.sort();
        if (!files.entries.empty())
            pending_.push_front(std::move(files));
        if (!folders.entries.empty())
            pending_.push_back(std::move(folders));
    }

    // The listing moves on before an entry is looked at, so that the entry whose successor can't be
    // read is lost with it.
    void read_(CDirListing&& listing, std::string const& prefix, CDirSiblings& files,
               CDirSiblings& folders) const {
        std::string name;
        for (bool isThere = listing.next(); isThere;) {
            CDirListing::SKind kind = listing.kind();
            name = listing.name();
            isThere = listing.next();
            if (kind.type == boost::filesystem::status_error)
                kind = listing.askKind(prefix + name, kind);
            if (wantsFolder_(kind))
                folders.add(name, kind.isLink);
            else if (wantsFile_(kind, name))
                files.add(name, kind.isLink);
        }
    }

    bool wantsFolder_(CDirListing::SKind const& kind) const {
        return kind.type == boost::filesystem::directory_file &&
               (recursive_ != eNotRecursive || delivers_(eFolders));
    }

    bool wantsFile_(CDirListing::SKind const& kind, std::string const& name) const {
        return kind.type == boost::filesystem::regular_file && delivers_(eFiles) &&
               (extension_.empty() || entry_matches_extension_(name));
    }

    bool entry_matches_extension_(std::string_view name) const {
        boost::filesystem::path const extension =
            boost::filesystem::path(name.begin(), name.end()).extension();
        return !extension.empty() &&
               Encoding::convert<Strings::string>(extension.native()) == dottedExtension_;
    }

    bool delivers_(EFlags kind) const { return (flags_ & kind) != 0; }

    std::deque<SWaiting> pending_; // none of them empty
    CDirReach reach_;
    CFileSpec root_;
    Strings::string extension_;
    Strings::string dottedExtension_;
    unsigned int flags_;
    ERecursive recursive_;
};

CDirIterator::CDirIterator() = default;

CDirIterator::CDirIterator(CFileSpec const& root, ERecursive recursive, unsigned int flags)
    : CDirIterator(root, Strings::string(), recursive, flags) {}

CDirIterator::CDirIterator(CFileSpec const& root, unsigned int flags, ERecursive recursive)
    : CDirIterator(root, Strings::string(), recursive, flags) {}

CDirIterator::CDirIterator(CFileSpec const& root, Strings::string const& extension,
                           ERecursive recursive, unsigned int flags)
    : impl_(std::make_unique<Impl_>(root, extension, flags, recursive)) {
    if (impl_->empty())
        impl_.reset();
    else
        impl_->setCurrent(current_);
}

CDirIterator::CDirIterator(CFileSpec const& root, Strings::string const& extension,
                           unsigned int flags, ERecursive recursive)
    : CDirIterator(root, extension, recursive, flags) {}

CDirIterator::CDirIterator(CDirIterator const& other)
    : impl_(other.impl_ ? other.impl_->clone() : nullptr), current_(other.current_) {}

CDirIterator& CDirIterator::operator=(CDirIterator const& other) {
    if (this != &other) {
        impl_.reset();
        current_ = other.current_;
        if (other.impl_)
            impl_ = other.impl_->clone();
    }
    return *this;
}

CDirIterator::~CDirIterator() = default;

CDirIterator& CDirIterator::operator++() {
    if (impl_ && impl_->next()) {
        impl_->setCurrent(current_);
    } else {
        impl_.reset();
        current_ = L"invalid";
    }
    return *this;
}

bool operator==(CDirIterator const& left, CDirIterator const& right) {
    return left.impl_ == right.impl_ || left.current_ == right.current_;
}

bool operator!=(CDirIterator const& left, CDirIterator const& right) {
    return !(left == right);
}

} // namespace FileSys
