// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/CJsonWriter.h"
#include "brindle/present/ReadingJson.h"
#include "brindle/present/ShownSong.h"

#include <string>

namespace brindle {

/// The keys of a song as strict JSON, with the points of all 24 keys; see docs/json.md. `song`
/// may be null.
[[nodiscard]] std::string KeysJson(const CShownKeys& keys, const CReadSong* song = nullptr);

/// Writes the members for the key of the song and for its regions into an object, without points.
void WriteKeys(CJsonWriter& json, const CShownKeys& keys);

}  // namespace brindle
