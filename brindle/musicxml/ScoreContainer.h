// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace brindle {

/// Whether the bytes are a compressed container, as a ".mxl" file is.
[[nodiscard]] bool IsScoreContainer(std::string_view bytes);

/// The score inside a compressed container: the file that META-INF/container.xml names, or, where
/// that names none or is not well-formed, the first score file outside META-INF. Nothing if there
/// is none, or if the container is damaged.
[[nodiscard]] std::optional<std::string> ScoreInContainer(std::string_view bytes);

/// What is wrong with a container in which `ScoreInContainer` finds nothing.
[[nodiscard]] std::string ContainerFault(std::string_view bytes);

}  // namespace brindle
