// SPDX-License-Identifier: MIT
#include "brindle/platform/ReadDouble.h"

#include <locale.h>
#include <stdlib.h>
#ifdef __APPLE__
#include <xlocale.h>
#endif

namespace brindle {

double ReadDouble(const std::string& text) {
    static const locale_t kClassic = newlocale(LC_ALL_MASK, "C", nullptr);
    return strtod_l(text.c_str(), nullptr, kClassic);
}

}  // namespace brindle
