// SPDX-License-Identifier: MIT
#pragma once

namespace brindle {

struct CSong;

/// Makes all texts of a song fit to be shown or sent on: see Printable.
void MakePrintable(CSong& song);

}  // namespace brindle
