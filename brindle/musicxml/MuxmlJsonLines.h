// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/MusicXmlParserDelegate.h"
#include "brindle/musicxml/MuxmlJson.h"
#include "brindle/platform/Error.h"

#include <functional>
#include <string>

namespace brindle {

/// A host that writes down what it is told: each call becomes a JSON object on one line, without
/// the end of the line. `call` is the name of the method; behind it come the fields of the record,
/// see CMuxmlJson, or `in` with the values of a call without a record of named fields.
[[nodiscard]] MusicXmlParserDelegate MuxmlJsonLines(TMuxmlEnumForm form,
                                                    std::function<void(const std::string&)> write);

/// The line behind these that tells how the import ended: `ok`, and without it the error.
[[nodiscard]] std::string MuxmlResultLine(bool isOk, const Error& error);

}  // namespace brindle
