// SPDX-License-Identifier: MIT
#pragma once

#include <initializer_list>
#include <span>
#include <string>
#include <string_view>

namespace brindle::cli {

/// What stands in a place of a message.
struct CFilledPlace {
    std::string_view mName;
    std::string_view mText;
};

/// A message in the language of the user, its places filled: "{name} is empty". The catalogues in
/// data/locale have each English text that stands in a call.
[[nodiscard]] std::string Message(const char* english,
                                  std::initializer_list<CFilledPlace> places = {});
[[nodiscard]] std::string Message(const char* english, std::span<const CFilledPlace> places);

}  // namespace brindle::cli
