// SPDX-License-Identifier: MIT
#pragma once

// The rules of spelling on a key number and an accidental: which pairs make sense, how one that
// does not is repaired, and one step of respelling.
#include "brindle/theory/EnhShift.h"
#include "brindle/theory/MakeSensefulEnh.h"
