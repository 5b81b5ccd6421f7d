// SPDX-License-Identifier: MIT
#pragma once

#include <map>
#include <string>

namespace brindle::test {

/// The texts of one language by their English keys, as data/locale has them.
[[nodiscard]] std::map<std::string, std::string> ReadCatalogue(const std::string& language);

}  // namespace brindle::test
