/// Compile-time tags: types that stand for a name.
///
///     template <class TText> struct CTag_Name_Example {
///         static TText get_tag_name() { return "Example"; }
///     };
///     using TExample = TemplMeta::CTag<CTag_Name_Example<char const*> >;
#ifndef QORN_1BASE_TEMPLMETATAG_H
#define QORN_1BASE_TEMPLMETATAG_H

namespace TemplMeta {

/// The end of every list, and the mark of a template argument that is left free.
struct CNil {};

/// Stands for one name. Two tags are the same exactly when their types are.
template <class TName>
struct CTag {};

} // namespace TemplMeta

#endif
