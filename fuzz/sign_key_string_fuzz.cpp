// SPDX-License-Identifier: MIT
#include "brindle/theory/CSignKeyHeavy.h"
#include "brindle/theory/CSignKeyLite.h"
#include "brindle/theory/SignKeyCode.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string_view>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string_view text(reinterpret_cast<const char*>(data), size);
    const brindle::CSignKeyLite signKey(text);
    if (signKey.mSignKeyType == brindle::TSignKeyType_Undef) std::abort();
    const unsigned char code = brindle::ToSignKeyInEv(signKey.mRootKeyEnh, signKey.mSignKeyType);
    if (code > 30) std::abort();
    if (signKey.IsUndef() != signKey.ToSignKeyHeavy().IsUndef()) std::abort();
    return 0;
}
