/// Walking a folder or a tree in a fixed order.
///
///     using Iterator = FileSys::CDirIterator;
///     for (Iterator i(folder, L"pdf", Iterator::eRecursive, Iterator::eFiles); i != Iterator();
///     ++i)
///         read(*i);
#ifndef QORN_2SYSTEM_FILESYSDIRITERATOR_H
#define QORN_2SYSTEM_FILESYSDIRITERATOR_H

#include "1Base/Strings/StringsKinds.h"
#include "2System/FileSys/FileSysFileSpec.h"

#include <cstddef>
#include <iterator>
#include <memory>

namespace FileSys {

/// An input iterator over regular files and folders; links are followed, and a link that leads
/// nowhere, a device or a socket is passed over. There is no guard against a cycle of links.
///
/// When a folder is opened its files go, sorted, in front of all that is waiting, and its sub
/// folders, sorted, behind it. The walk asks the disk once an entry and reads one folder at a time;
/// what was found is delivered even if it has gone since. A folder that can't be listed ends where
/// its listing failed, and nothing is reported. Folders below the root may have longer paths than a
/// call of the system takes. A name that is not UTF-8 raises TExcEncoding when
/// it is delivered, and the walk may go on behind it; under a filter an extension that is not UTF-8
/// raises when its folder is opened.
///
/// Copies walk on by themselves. An iterator belongs to one thread.
class CDirIterator {
  public:
    /// @{
    /// What the standard asks of an input iterator.
    using iterator_category = std::input_iterator_tag;
    using value_type = CFileSpec;
    using difference_type = std::ptrdiff_t;
    using pointer = CFileSpec const*;
    using reference = CFileSpec const&;
    /// @}

    /// Whether the walk descends into sub folders.
    enum ERecursive { eNotRecursive = 0, eRecursive = 1 };

    /// What is delivered.
    enum EFlags : unsigned int { eFiles = 1, eFolders = 2 };

    /// The end.
    CDirIterator();

    /// @{
    /// Stands on the first entry, or at the end: there is no error for a missing root. The
    /// extension has no dot and its case matters; empty, it lets all pass. It filters what is
    /// delivered, not where the walk descends.
    CDirIterator(CFileSpec const& root, ERecursive recursive, unsigned int flags);
    CDirIterator(CFileSpec const& root, unsigned int flags, ERecursive recursive);
    CDirIterator(CFileSpec const& root, Strings::string const& extension, ERecursive recursive,
                 unsigned int flags);
    CDirIterator(CFileSpec const& root, Strings::string const& extension, unsigned int flags,
                 ERecursive recursive);
    /// @}

    /// @{
    /// The copy stands on the same entry and walks on by itself.
    CDirIterator(CDirIterator const& other);
    CDirIterator& operator=(CDirIterator const& other);
    /// @}

    ~CDirIterator();

    /// @{
    /// At the end: the empty specification, or "invalid" once the walk has run out.
    CFileSpec const& operator*() const { return current_; }
    CFileSpec const* operator->() const { return &current_; }
    /// @}

    /// Goes to the next entry, or to the end; at the end it stays there.
    CDirIterator& operator++();

    /// @{
    /// Equal where both are at their end, or stand on the same path.
    friend bool operator==(CDirIterator const& left, CDirIterator const& right);
    friend bool operator!=(CDirIterator const& left, CDirIterator const& right);
    /// @}

  private:
    class Impl_;

    std::unique_ptr<Impl_> impl_;
    CFileSpec current_;
};

} // namespace FileSys

#endif
