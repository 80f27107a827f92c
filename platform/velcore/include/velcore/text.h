// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <velcore/velcore_export.h>

namespace Vel {

/**
 * Tells whether a text is percent-escaped UTF-8, and unescapes it.
 *
 * @param text a zero-terminated text
 * @param out receives the unescaped bytes, zero-terminated; as long as the text plus one.
 *            Its contents are unspecified when the result is false
 * @return true when at least one "%" stands in the text, every "%" begins two hexadecimal
 *         digits, and the unescaped bytes are valid UTF-8. "%00" is refused: what stands
 *         behind a zero byte would be lost in \a out
 */
VELCORE_EXPORT bool isEscapedUtf8(const unsigned char *text, unsigned char *out);

} // namespace Vel
