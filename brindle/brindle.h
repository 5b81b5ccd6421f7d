// SPDX-License-Identifier: MIT
#pragma once

/// Everything a host needs, in one include. Made by tools/make_umbrella.sh.

#include "brindle/Version.h"
#include "brindle/chords/CChordLite.h"
#include "brindle/theory/CHarmCenterLite.h"
#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CScaleLite.h"
#include "brindle/theory/CSemitones.h"
#include "brindle/theory/CSignKeyLite.h"
#include "brindle/theory/TBasicChord.h"
#include "brindle/theory/TEnh.h"
#include "brindle/theory/TScaleType.h"
#include "brindle/theory/TSignKeyType.h"
#include "brindle/theory/Trace.h"
