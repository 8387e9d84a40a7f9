#include "2System/FileSys/_Imp/FileSysDirSiblings.h"

#include "2System/MacOS/MacOSCFStringConverter.h"
#include "2System/MacOS/MacOSTempCFString.h"

#include <algorithm>

namespace FileSys {
namespace {

// No name can hold it.
constexpr char separator = '/';

// As much as is decoded at once, in bytes: more would gain nothing.
constexpr std::size_t enough = 4096;

// Where the name ends whose separator stands at `begin`.
template <class TText>
std::size_t endOfName(TText const& text, std::size_t begin) {
    return std::min(text.find(separator, begin + 1), text.size());
}

// Empty where the text is not UTF-8.
Strings::string decode(std::string const& text) {
    CFStringRef const ref = MacOS::GetCFString(text);
    return ref == nullptr ? Strings::string()
                          : MacOS::GetStringFromCFString(MacOS::CTempCFString(ref).get());
}

} // namespace

void CDirSiblings::add(std::string_view name, bool isLink) {
    names_ += separator;
    names_ += name;
    isLink_.push_back(isLink);
}

void CDirSiblings::sort() {
    std::vector<SName> names;
    names.reserve(isLink_.size());
    for (bool const isLink : isLink_) {
        names.push_back({name(), isLink});
        front_ = endOfName(names_, front_);
    }
    std::sort(names.begin(), names.end(),
              [](SName const& left, SName const& right) { return left.text < right.text; });
    CDirSiblings sorted(prefix_, links_);
    sorted.names_.reserve(names_.size());
    sorted.isLink_.reserve(names.size());
    for (SName const& name : names)
        sorted.add(name.text, name.isLink);
    names_ = std::move(sorted.names_);
    isLink_ = std::move(sorted.isLink_);
    front_ = 0;
}

void CDirSiblings::pop() {
    front_ = endOfName(names_, front_);
    ++number_;
    if (!wideNames_.empty())
        wideFront_ = endOfName(wideNames_, wideFront_);
}

std::string_view CDirSiblings::name() const {
    return std::string_view(names_).substr(front_ + 1, endOfName(names_, front_) - front_ - 1);
}

void CDirSiblings::getFileSpec(CFileSpec& spec) {
    if (front_ >= decodedEnd_)
        decode_();
    if (wideNames_.empty()) {
        spec = CFileSpec(path());
        return;
    }
    path_.resize(prefixLength_);
    path_.append(wideNames_, wideFront_ + 1, endOfName(wideNames_, wideFront_) - wideFront_ - 1);
    spec = path_;
}

// Nothing is raised here: a name that is not UTF-8 leaves those beside it as good as ever, each to
// be decoded by itself. So does a single one.
void CDirSiblings::decode_() {
    decodedEnd_ = endOfName(names_, std::min(front_ + enough, names_.size()));
    wideNames_.clear();
    wideFront_ = 0;
    if (endOfName(names_, front_) == decodedEnd_)
        return;
    if (path_.empty()) {
        path_ = decode(prefix_);
        prefixLength_ = path_.size();
    }
    if (!path_.empty())
        wideNames_ = decode(names_.substr(front_, decodedEnd_ - front_));
}

} // namespace FileSys
