// Names, values and signatures of the module: this unit has only to compile.

#include "1Base/Encoding/Encoding.h"

#include <string>
#include <type_traits>

namespace {

using Encoding::CConverter;
using Encoding::ESysEncoding;
using Encoding::EUTF16NormalizationForm;
using Strings::stringUTF16;
using TBytes = std::basic_string<unsigned char>;

static_assert(std::is_same_v<std::underlying_type_t<EUTF16NormalizationForm>, unsigned int>);
static_assert(std::is_convertible_v<EUTF16NormalizationForm, unsigned int>);
static_assert(Encoding::enfD == 0 && Encoding::enfKD == 1);
static_assert(Encoding::enfC == 2 && Encoding::enfKC == 3);

static_assert(std::is_same_v<std::underlying_type_t<ESysEncoding>, unsigned int>);
static_assert(std::is_convertible_v<ESysEncoding, unsigned int>);
static_assert(Encoding::eseCurrent == 0 && Encoding::eseISO8859_1 == 52);
static_assert(Encoding::eseUTF8 == 53 && Encoding::eseUTF16 == 54 && Encoding::eseUTF32 == 55);
static_assert(Encoding::eseUTF16CanonicalComposed == 56);

static_assert(std::is_same_v<decltype(Encoding::normalize),
                             stringUTF16(stringUTF16 const&, EUTF16NormalizationForm)>);
static_assert(std::is_same_v<decltype(Encoding::convertUTF8ToUTF32),
                             Strings::stringUTF32(Strings::stringUTF8 const&)>);
static_assert(std::is_same_v<decltype(Encoding::convert<std::string, Strings::string>),
                             std::string(Strings::string const&)>);
static_assert(std::is_same_v<decltype(Encoding::convert<Strings::string, char const*>),
                             Strings::string(char const* const&)>);

template <class TTarget, class TSource>
constexpr bool convertsPlainly =
    std::is_same_v<decltype(CConverter<TTarget, TSource>::convert), TTarget(TSource const&)>;

static_assert(convertsPlainly<stringUTF16, std::string>);
static_assert(convertsPlainly<std::string, stringUTF16>);
static_assert(convertsPlainly<stringUTF16, Strings::string>);
static_assert(convertsPlainly<Strings::string, stringUTF16>);
static_assert(convertsPlainly<std::string, Strings::string>);
static_assert(convertsPlainly<Strings::string, std::string>);
static_assert(convertsPlainly<TBytes, Strings::string>);

static_assert(std::is_same_v<decltype(CConverter<stringUTF16, TBytes>::convert),
                             stringUTF16(TBytes const&, ESysEncoding)>);
static_assert(std::is_same_v<decltype(CConverter<TBytes, stringUTF16>::convert),
                             TBytes(stringUTF16 const&, ESysEncoding)>);

template <class TString>
constexpr bool returnsItsArgument =
    std::is_same_v<decltype(CConverter<TString, TString>::convert), TString const&(TString const&)>;

static_assert(returnsItsArgument<Strings::string> && returnsItsArgument<std::string>);
static_assert(returnsItsArgument<stringUTF16> && returnsItsArgument<TBytes>);

} // namespace
