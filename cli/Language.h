// SPDX-License-Identifier: MIT
#pragma once

namespace brindle::cli {

/// Lets names that are translated come in the language that the environment asks for. Numbers and
/// characters stay as they are in every language.
void UseLanguageOfUser();

}  // namespace brindle::cli
