// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/c/brindle.h"

#include <cstddef>
#include <exception>
#include <new>
#include <string_view>

/// What all functions of the C interface share: errors of the thread, exceptions that are stopped,
/// and texts that leave the library.
namespace brindle::border {

/// Keeps what is wrong for brindle_last_error; `position` is in characters from 1, 0 for none.
brindle_status Fail(brindle_status status, std::string_view what,
                    std::size_t position = 0) noexcept;
/// `name` is that of a parameter.
brindle_status FailForNull(std::string_view name) noexcept;
brindle_status FailForIndex(std::size_t index, std::size_t count) noexcept;
void ForgetFault() noexcept;

/// Makes the call, which gives a status; what it throws becomes one.
template <class TCall>
brindle_status Guarded(const TCall& call) noexcept {
    ForgetFault();
    try {
        return call();
    } catch (const std::bad_alloc&) {
        return Fail(BRINDLE_ERROR_MEMORY, "there is not enough memory");
    } catch (const std::exception& exception) {
        return Fail(BRINDLE_ERROR_INTERNAL, exception.what());
    } catch (...) {
        return Fail(BRINDLE_ERROR_INTERNAL, "an unknown fault");
    }
}

/// A copy for the caller to free, with a NUL behind it; `size` may be null.
brindle_status GiveText(std::string_view text, char** out, std::size_t* size = nullptr);

/// The bytes of a caller; no bytes need no place.
[[nodiscard]] std::string_view BytesOf(const void* bytes, std::size_t size);

}  // namespace brindle::border
