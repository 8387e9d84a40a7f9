/// A message that tells what its last expansion left over.
#ifndef QORN_TESTS_STRINGSMESSAGEPROBE_H
#define QORN_TESTS_STRINGSMESSAGEPROBE_H

#include "1Base/Strings/StringsMessage.h"

#include <string>
#include <utility>
#include <vector>

namespace TestSupport {

using TParameters = Strings::CParameterList<wchar_t>;
using TMessage = Strings::CMessage<wchar_t, TParameters>;
using TLeftovers = std::vector<std::pair<std::string, std::wstring>>;

class CMessageProbe : public TMessage {
  public:
    using TMessage::TMessage;

    TLeftovers const& leftovers() const { return leftovers_; }

  protected:
    void doInsertParameters(std::wstring& text, wchar_t escape, wchar_t const& open,
                            wchar_t const& close, TMap const& all, TMap& remaining) const override {
        TMessage::doInsertParameters(text, escape, open, close, all, remaining);
        leftovers_.assign(remaining.begin(), remaining.end());
    }

  private:
    mutable TLeftovers leftovers_;
};

} // namespace TestSupport

#endif
