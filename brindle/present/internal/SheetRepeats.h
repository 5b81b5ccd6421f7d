// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/internal/Sheet.h"

namespace brindle::LeadSheet {

/// Takes from a sheet the bars that repeat those directly before them, and writes repeat signs,
/// endings and remarks into the bars that stay.
void FoldRepeats(const CSong& song, CSheet& sheet);

}  // namespace brindle::LeadSheet
