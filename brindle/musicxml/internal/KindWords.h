// SPDX-License-Identifier: MIT
#pragma once

#include <string_view>

namespace brindle {

struct TMusicXMLHarmony;

/// Puts the kind of a chord into the words of HarmonyKinds.h. An empty kind is major. One that is
/// none of these words is told by another name of it, by how it is printed ("m7" in `printed`), or
/// else by its degrees above the root alone.
///
/// Also tells whether it was an augmented sixth, which some of these words say no more.
void SetKind(TMusicXMLHarmony& harmony, std::string_view printed);

}  // namespace brindle
