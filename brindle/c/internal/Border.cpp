// SPDX-License-Identifier: MIT
#include "brindle/c/internal/Border.h"

#include <fmt/format.h>

#include <cstdlib>
#include <cstring>
#include <string>

namespace brindle::border {
namespace {

struct CFaultOfThread {
    /// Of a text that is not ours and never freed; used where there is no memory for another.
    const char* mFixed = "";
    std::string mText;
    std::size_t mPosition = 0;
};

CFaultOfThread& FaultOfThread() {
    thread_local CFaultOfThread fault;
    return fault;
}

}  // namespace

brindle_status Fail(brindle_status status, std::string_view what, std::size_t position) noexcept {
    CFaultOfThread& fault = FaultOfThread();
    fault.mPosition = position;
    try {
        fault.mText = what;
        fault.mFixed = nullptr;
    } catch (...) {
        fault.mFixed = "there is not enough memory";
    }
    return status;
}

brindle_status FailForNull(std::string_view name) noexcept {
    std::string what;
    try {
        what = fmt::format("{} is NULL", name);
    } catch (...) {
        return Fail(BRINDLE_ERROR_ARGUMENT, "NULL");
    }
    return Fail(BRINDLE_ERROR_ARGUMENT, what);
}

brindle_status FailForIndex(std::size_t index, std::size_t count) noexcept {
    std::string what;
    try {
        what = fmt::format("there is no element {} of {}", index, count);
    } catch (...) {
        return Fail(BRINDLE_ERROR_ARGUMENT, "an index out of range");
    }
    return Fail(BRINDLE_ERROR_ARGUMENT, what);
}

void ForgetFault() noexcept {
    CFaultOfThread& fault = FaultOfThread();
    fault.mFixed = "";
    fault.mPosition = 0;
}

brindle_status GiveText(std::string_view text, char** out, std::size_t* size) {
    auto* const copy = static_cast<char*>(std::malloc(text.size() + 1));
    if (copy == nullptr) throw std::bad_alloc();
    if (!text.empty()) std::memcpy(copy, text.data(), text.size());
    copy[text.size()] = '\0';
    *out = copy;
    if (size != nullptr) *size = text.size();
    return BRINDLE_OK;
}

std::string_view BytesOf(const void* bytes, std::size_t size) {
    return size == 0 ? std::string_view() : std::string_view(static_cast<const char*>(bytes), size);
}

}  // namespace brindle::border

const char* brindle_last_error(void) {
    const auto& fault = brindle::border::FaultOfThread();
    return fault.mFixed != nullptr ? fault.mFixed : fault.mText.c_str();
}

size_t brindle_last_error_position(void) {
    return brindle::border::FaultOfThread().mPosition;
}

void brindle_free(char* text) {
    std::free(text);
}
