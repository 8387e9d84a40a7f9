/// A slow twin of the legacy codecs: two maps, walked character by character.
///
/// Its codes come from the lines of the generated tables' source, from ICU's converter one by one,
/// or, for ISO 8859-1, from the rule. It shares no code with what it is compared with.
#ifndef QORN_TESTS_CFLEGACYTWIN_H
#define QORN_TESTS_CFLEGACYTWIN_H

#include "support/LegacyEncodings.h"

#include <map>
#include <optional>
#include <random>
#include <string>
#include <vector>

namespace TestSupport {

class CLegacyTwin {
  public:
    explicit CLegacyTwin(CLegacyEncoding const& encoding);

    /// Each code of one or two bytes, and its text.
    std::map<std::string, std::u16string> const& codes() const { return codes_; }

    std::optional<std::u16string> decode(std::string const& bytes) const;

    /// The characters of a text in turn: how many units each has, and what it is written as.
    std::vector<CEncoded> encode(std::u16string const& units) const;

    /// A text of up to `pieces` runs: characters of the encoding and others, bases with marks,
    /// surrogates in pairs and alone, ASCII, and beginnings of longer texts.
    std::u16string drawText(std::mt19937& random, unsigned pieces) const;

    /// Bytes in the encoding; where `damaged`, some that are not in it stand among them.
    std::string drawBytes(std::mt19937& random, unsigned pieces, bool damaged) const;

  private:
    void readConverter(char const* name);
    std::optional<CEncoded> longest(std::u16string const& units) const;

    std::map<std::string, std::u16string> codes_;
    std::map<std::u16string, std::string> written_;
    std::vector<std::string> drawable_;
    bool composes_ = false;
};

} // namespace TestSupport

#endif
