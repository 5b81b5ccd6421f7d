// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>

namespace brindle::cli {

/// What the library says of a fault, in the language of the user: it speaks English, so that its
/// results are the same everywhere. A sentence that is not known stays as it is.
[[nodiscard]] std::string FaultMessage(std::string_view english);

}  // namespace brindle::cli
