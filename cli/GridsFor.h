// SPDX-License-Identifier: MIT
#pragma once

namespace brindle::cli {

class CCommand;

/// Adds "grids for".
void AddGridsFor(CCommand& grids);

}  // namespace brindle::cli
