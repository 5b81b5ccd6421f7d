// SPDX-License-Identifier: MIT
#include "brindle/c/internal/Border.h"
#include "brindle/c/internal/Values.h"

#include "brindle/platform/Utf8.h"
#include "brindle/present/ShownNames.h"
#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/ReadKeyText.h"

#include <fmt/format.h>

#include <string>
#include <string_view>

using namespace brindle::border;

namespace {

// The readers count bytes, and hosts characters.
template <class TRead>
brindle_status FailForName(const TRead& read, std::string_view typed) {
    const std::size_t before = brindle::CountUtf8Characters(typed.substr(0, read.mColumn));
    return Fail(BRINDLE_ERROR_INPUT, read.mError, before + 1);
}

brindle_status FailForUndefined(std::string_view what) {
    return Fail(BRINDLE_ERROR_ARGUMENT, fmt::format("an undefined {}", what));
}

std::string_view NameOfScale(const brindle::CScaleHeavy& scale) {
    return scale.ScaleType() == brindle::st_custom ? "Custom" : scale.ScaleRow().mName;
}

}  // namespace

brindle_status brindle_tone_write(const brindle_tone* tone, const brindle_style* style,
                                  char** text) {
    if (text == nullptr) return FailForNull("text");
    *text = nullptr;
    if (tone == nullptr) return FailForNull("tone");
    return Guarded([&] {
        const brindle::CKeyEnh key = FromC(*tone);
        if (key.IsUndef()) return FailForUndefined("tone");
        return GiveText(WriteNoteName(key, FromC(style)), text);
    });
}

brindle_status brindle_key_read(const char* text, brindle_key* key) {
    if (key == nullptr) return FailForNull("key");
    *key = ToC(brindle::CSignKeyLite());
    if (text == nullptr) return FailForNull("text");
    return Guarded([&] {
        const brindle::CKeyText read = brindle::ReadKeyText(text);
        if (!read.mError.empty()) return FailForName(read, text);
        *key = ToC(read.mSignKey);
        return BRINDLE_OK;
    });
}

brindle_status brindle_key_write(const brindle_key* key, char** text) {
    if (text == nullptr) return FailForNull("text");
    *text = nullptr;
    if (key == nullptr) return FailForNull("key");
    return Guarded([&] {
        const brindle::CSignKeyLite signKey = FromC(*key);
        if (signKey.IsUndef()) return FailForUndefined("key");
        return GiveText(signKey.NameLong(brindle::NamePrefs()), text);
    });
}

int brindle_key_signature(const brindle_key* key) {
    if (key == nullptr) return 0;
    const brindle::CSignKeyLite signKey = FromC(*key);
    return signKey.IsUndef() ? 0 : signKey.SignsCount();
}

brindle_status brindle_key_relative(const brindle_key* key, brindle_key* relative) {
    if (relative == nullptr) return FailForNull("relative");
    if (key == nullptr) {
        *relative = ToC(brindle::CSignKeyLite());
        return FailForNull("key");
    }
    return Guarded([&] {
        const brindle::CSignKeyLite signKey = FromC(*key);
        *relative = ToC(brindle::CSignKeyLite());
        if (signKey.IsUndef()) return FailForUndefined("key");
        *relative = ToC(signKey.ParallelSignKey());
        return BRINDLE_OK;
    });
}

brindle_status brindle_key_scale(const brindle_key* key, brindle_scale* scale) {
    if (scale == nullptr) return FailForNull("scale");
    *scale = ToC(brindle::CScaleLite());
    if (key == nullptr) return FailForNull("key");
    return Guarded([&] {
        const brindle::CSignKeyLite signKey = FromC(*key);
        if (signKey.IsUndef()) return FailForUndefined("key");
        *scale = ToC(signKey.Scale());
        return BRINDLE_OK;
    });
}

brindle_status brindle_scale_read(const char* text, brindle_scale* scale) {
    if (scale == nullptr) return FailForNull("scale");
    *scale = ToC(brindle::CScaleLite());
    if (text == nullptr) return FailForNull("text");
    return Guarded([&] {
        const brindle::CScaleText read = brindle::ReadScaleText(text);
        if (!read.mError.empty()) return FailForName(read, text);
        *scale = ToC(brindle::CScaleLite(read.mScale));
        return BRINDLE_OK;
    });
}

brindle_status brindle_scale_write(const brindle_scale* scale, char** text) {
    if (text == nullptr) return FailForNull("text");
    *text = nullptr;
    if (scale == nullptr) return FailForNull("scale");
    return Guarded([&] {
        const brindle::CScaleLite lite = FromC(*scale);
        if (lite.IsUndef()) return FailForUndefined("scale");
        const brindle::CScaleHeavy heavy(lite.mRootKeyEnh, lite.mSemitones);
        return GiveText(
            fmt::format("{} {}", brindle::KeyName(lite.mRootKeyEnh), NameOfScale(heavy)), text);
    });
}

brindle_status brindle_scale_tones(const brindle_scale* scale, brindle_tone tones[12],
                                   size_t* count) {
    if (tones == nullptr || count == nullptr) return FailForNull("tones or count");
    *count = 0;
    if (scale == nullptr) return FailForNull("scale");
    return Guarded([&] {
        const brindle::CScaleLite lite = FromC(*scale);
        if (lite.IsUndef()) return FailForUndefined("scale");
        GiveTones(KeysOf(brindle::CScaleHeavy(lite.mRootKeyEnh, lite.mSemitones)), tones, count);
        return BRINDLE_OK;
    });
}
