#include "0Platform/CoreFoundation/_Imp/CFBundleInfo.h"

#include "0Platform/CoreFoundation/_Imp/CFStringUTF8.h"

#include <cstdint>
#include <cstdlib>
#include <fstream>
#include <sstream>

#include <plist/plist.h>

namespace CFPlatform {
namespace {

struct Free {
    void operator()(void* memory) const { std::free(memory); }
};
using TextOwner = std::unique_ptr<char, Free>;

struct NodeFree {
    void operator()(plist_t node) const { plist_free(node); }
};
using NodeOwner = std::unique_ptr<void, NodeFree>;

// Empty for what can't be read, a folder included.
std::string readFile(std::string const& file) {
    std::ostringstream content;
    content << std::ifstream(file, std::ios_base::binary).rdbuf();
    return content.str();
}

NodeOwner parse(std::string const& bytes) {
    plist_t root = nullptr;
    if (bytes.size() > UINT32_MAX)
        return nullptr;
    auto const size = static_cast<std::uint32_t>(bytes.size());
    // Not plist_from_memory(): later releases gave it another argument.
    if (plist_is_binary(bytes.data(), size) != 0)
        plist_from_bin(bytes.data(), size, &root);
    else
        plist_from_xml(bytes.data(), size, &root);
    return NodeOwner(root);
}

// Null where the node is no text, or one that is not UTF-8.
StringOwner textOf(plist_t node) {
    if (plist_get_node_type(node) != PLIST_STRING)
        return nullptr;
    std::uint64_t size = 0;
    char const* const text = plist_get_string_ptr(node, &size);
    return StringOwner(createFromUTF8({text, size}));
}

} // namespace

BundleInfo readBundleInfo(std::string const& file) {
    BundleInfo info;
    NodeOwner const root = parse(readFile(file));
    plist_dict_iter place = nullptr;
    if (root && plist_get_node_type(root.get()) == PLIST_DICT)
        plist_dict_new_iter(root.get(), &place);
    std::unique_ptr<void, Free> const placeOwner(place);
    while (place != nullptr) {
        char* key = nullptr;
        plist_t value = nullptr;
        plist_dict_next_item(root.get(), place, &key, &value);
        TextOwner const keyOwner(key);
        if (value == nullptr)
            break;
        if (StringOwner text = textOf(value))
            info[key] = std::move(text);
    }
    return info;
}

} // namespace CFPlatform
