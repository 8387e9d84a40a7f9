/// Normalisation of text (Unicode Standard Annex #15).
///
///     Encoding::normalize(text, Encoding::enfC);   // e and U+0301 become U+00E9
#ifndef QORN_1BASE_ENCODINGNORMALIZE_H
#define QORN_1BASE_ENCODINGNORMALIZE_H

#include "1Base/Strings/StringsKinds.h"

namespace Encoding {

/// The four forms. Any other value means canonical composition.
enum EUTF16NormalizationForm : unsigned int {
    enfD = 0,  ///< canonical decomposition
    enfKD = 1, ///< compatibility decomposition
    enfC = 2,  ///< canonical composition
    enfKC = 3  ///< compatibility composition
};

/// The text in the given form, up to its first U+0000: what follows a zero unit is cut off.
Strings::stringUTF16 normalize(Strings::stringUTF16 const& source, EUTF16NormalizationForm form);

} // namespace Encoding

#endif
