/// Compile-time tags: types that stand for a name and can say it.
///
///     namespace Time {
///     TEMPLMETA_TAG_NAME(TimeDate);
///     using TTagTimeDate = TemplMeta::CTag<CTag_Name_TimeDate<char const*>>;
///     }
///     TemplMeta::getTagName<Time::TTagTimeDate>()   // "TimeDate"
#ifndef QORN_1BASE_TEMPLMETATAG_H
#define QORN_1BASE_TEMPLMETATAG_H

namespace TemplMeta {

/// The end of every list, and the mark of a template argument that is left free.
struct CNil {};

/// Stands for one name. Two tags are the same exactly when their types are, so a tag in an
/// anonymous namespace differs from a public one of the same name.
template <class TTagName>
struct CTag {
    /// The class that TEMPLMETA_TAG_NAME declared.
    using TName = TTagName;
};

/// The name that a tag stands for, a static text.
template <class TTag>
constexpr char const* getTagName() {
    return TTag::TName::get_tag_name();
}

} // namespace TemplMeta

/// Declares the tag-name class of the tag `name` in the enclosing namespace: the module's own for a
/// public tag, an anonymous one for a tag of a single file.
#define TEMPLMETA_TAG_NAME(name)                                                                   \
    template <class TText>                                                                         \
    struct CTag_Name_##name {                                                                      \
        static constexpr TText get_tag_name() { return #name; }                                    \
    }

#endif
