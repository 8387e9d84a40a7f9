/// Entries of one folder that wait for their turn, in order.
///
///     CDirSiblings files("/home/ada/", 0);
///     files.add("b", false);
///     files.add("a", false);
///     files.sort();
///     for (; !files.empty(); files.pop())
///         use(files.path());   // "/home/ada/a", then "/home/ada/b"
#ifndef QORN_2SYSTEM_FILESYSDIRSIBLINGS_H
#define QORN_2SYSTEM_FILESYSDIRSIBLINGS_H

#include "1Base/Strings/StringsKinds.h"
#include "2System/FileSys/FileSysFileSpec.h"

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace FileSys {

/// The names are one text: a path for each of many thousand, and a conversion of each, would cost
/// more than to list and to sort them.
class CDirSiblings {
  public:
    /// `prefix` is the folder's path with a separator behind it, `links` the number of links that
    /// the walk has followed down to there.
    CDirSiblings(std::string const& prefix, unsigned int links) : prefix_(prefix), links_(links) {}

    void add(std::string_view name, bool isLink);

    /// In the order of their bytes. Called once, behind the last add() and before all below.
    void sort();

    bool empty() const { return front_ == names_.size(); }
    void pop();

    /// Of the front one.
    std::string_view name() const;
    std::string path() const { return prefix_ + std::string(name()); }
    unsigned int links() const { return links_ + (isLink_[number_] ? 1U : 0U); }

    /// Makes `spec` the front one's. Raises TExcEncoding, and leaves `spec` as it was, where the
    /// path is not UTF-8.
    void getFileSpec(CFileSpec& spec);

  private:
    struct SName {
        std::string_view text;
        bool isLink;
    };

    void decode_();

    std::string prefix_;
    unsigned int links_;
    std::string names_;            // each behind a separator, from sort() on in order
    std::vector<bool> isLink_;     // of each
    std::size_t front_ = 0;        // where the front one's separator stands
    std::size_t number_ = 0;       // of the front one
    Strings::string path_;         // the prefix in wide text, and some name behind it
    std::size_t prefixLength_ = 0; // of that prefix
    std::size_t decodedEnd_ = 0;   // how far decode_() has come
    Strings::string wideNames_;    // from the front one to there, or empty
    std::size_t wideFront_ = 0;
};

} // namespace FileSys

#endif
