#include "2System/FileSys/FileSysDirIterator.h"

#include "1Base/Encoding/EncodingConverter.h"
#include "2System/FileSys/_Imp/FileSysDirListing.h"

#include <boost/filesystem/file_status.hpp>
#include <boost/filesystem/operations.hpp>
#include <boost/filesystem/path.hpp>

#include <algorithm>
#include <deque>
#include <exception>
#include <string>
#include <utility>
#include <vector>

namespace FileSys {
namespace {

// An entry that was found, with the status of what it leads to.
struct SFileData_t {
    boost::filesystem::path path;
    boost::filesystem::file_status status;

    bool is_directory() const { return boost::filesystem::is_directory(status); }
    bool is_file() const { return boost::filesystem::is_regular_file(status); }
};

using TEntries = std::vector<SFileData_t>;

// Orders the entries of one folder as their whole paths are ordered. All begin with the same text,
// which need not be compared.
class SFileDataComparator {
  public:
    explicit SFileDataComparator(std::size_t common) : common_(common) {}

    bool operator()(SFileData_t const& left, SFileData_t const& right) const {
        std::string const& other = right.path.native();
        return left.path.native().compare(common_, std::string::npos, other, common_,
                                          std::string::npos) < 0;
    }

  private:
    std::size_t common_;
};

// What the paths of a folder's entries begin with.
std::string prefixOf(boost::filesystem::path const& folder) {
    std::string prefix = folder.native();
    if (prefix.back() != '/')
        prefix += '/';
    return prefix;
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
    void setCurrent(CFileSpec& current) const {
        current = CFileSpec(pending_.front().path.native());
    }

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
    bool scan_(boost::filesystem::path const& folder) {
        list_(folder);
        return fetch_first_consumable_();
    }

    bool fetch_first_consumable_() {
        while (!pending_.empty() && !isConsumable_(pending_.front()))
            leaveFront_();
        return !pending_.empty();
    }

    void leaveFront_() {
        SFileData_t const front = std::move(pending_.front());
        pending_.pop_front();
        if (recursive_ == eRecursive && front.is_directory())
            list_(front.path);
    }

    // Files passed the filter when they were listed.
    bool isConsumable_(SFileData_t const& entry) const {
        if (delivers_(eFolders) && entry.is_directory())
            return extension_.empty() || entry_matches_extension_(entry.path);
        return delivers_(eFiles) && entry.is_file();
    }

    void list_(boost::filesystem::path const& folder) {
        TEntries files;
        TEntries folders;
        read_(folder, files, folders);
        SFileDataComparator const comparator(folder.size());
        std::sort(files.begin(), files.end(), comparator);
        std::sort(folders.begin(), folders.end(), comparator);
        pending_.insert(pending_.begin(), std::make_move_iterator(files.begin()),
                        std::make_move_iterator(files.end()));
        pending_.insert(pending_.end(), std::make_move_iterator(folders.begin()),
                        std::make_move_iterator(folders.end()));
    }

    // What was found before a failure counts. The listing moves on before an entry is looked at, so
    // that the entry whose successor can't be read is lost with it.
    void read_(boost::filesystem::path const& folder, TEntries& files, TEntries& folders) const {
        std::string const prefix = prefixOf(folder);
        try {
            CDirListing listing(folder.native());
            for (bool isThere = listing.next(); isThere;) {
                boost::filesystem::file_type const type = listing.type();
                SFileData_t data = {prefix + listing.name(), boost::filesystem::file_status(type)};
                isThere = listing.next();
                if (type == boost::filesystem::status_error)
                    data.status = boost::filesystem::status(data.path);
                sortIn_(std::move(data), files, folders);
            }
        } catch (std::exception const&) {
        }
    }

    void sortIn_(SFileData_t&& data, TEntries& files, TEntries& folders) const {
        bool const wantsFolders = recursive_ != eNotRecursive || delivers_(eFolders);
        if (wantsFolders && data.is_directory())
            folders.push_back(std::move(data));
        else if (delivers_(eFiles) && data.is_file() &&
                 (extension_.empty() || entry_matches_extension_(data.path)))
            files.push_back(std::move(data));
    }

    bool entry_matches_extension_(boost::filesystem::path const& path) const {
        boost::filesystem::path const extension = path.extension();
        return !extension.empty() &&
               Encoding::convert<Strings::string>(extension.native()) == dottedExtension_;
    }

    bool delivers_(EFlags kind) const { return (flags_ & kind) != 0; }

    std::deque<SFileData_t> pending_;
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
