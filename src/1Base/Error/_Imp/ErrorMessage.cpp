#include "1Base/Error/ErrorMessage.h"

#include "1Base/Error/ErrorException.h"
#include "1Base/StdUtil/StdUtilStreamCast.h"

#include <utility>

namespace Error {

CMessage::CMessageLoader const* CMessage::msgLoader_ = nullptr;

Strings::string CMessage::CMessageLoader::load(EMsgID const& id) const {
    Strings::string text = doLoadMessage(id);
    if (!text.empty())
        return text;
    return L"<#" + StdUtil::stream_cast<Strings::string>(id) + L">?";
}

CMessage::CMessage(EMsgID const& id, Strings::CParameterList<wchar_t> params)
    : TBase(loadMessage(id), std::move(params)) {}

CMessage::CMessage(CException const& exc) : TBase(StdUtil::stream_cast<Strings::string>(exc)) {}

Strings::string CMessage::loadMessage(EMsgID const& id) {
    return msgLoader_ != nullptr ? msgLoader_->load(id) : loadDefaultMessage(id);
}

CMessage::CMessageLoader const* CMessage::setMessageLoader(CMessageLoader const* loader) {
    return std::exchange(msgLoader_, loader);
}

CMessage operator+(CMessage const& message, Strings::CParameterList<wchar_t> const& params) {
    CMessage result(message);
    result.add(params);
    return result;
}

COSErrMessage::COSErrMessage() : CMessage(std::string("unknown error")) {}

COSErrMessage::COSErrMessage(short) : COSErrMessage() {}

} // namespace Error
