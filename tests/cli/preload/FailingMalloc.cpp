// SPDX-License-Identifier: MIT
// Loaded in front of the C library: fails the request for memory that BRINDLE_FAILING_MALLOC names,
// counted from 1, or with a + behind the number this one and all that follow. Tells by a file of
// the name BRINDLE_FAILED_MARK that it did.
#include <fcntl.h>
#include <unistd.h>

#include <atomic>
#include <cerrno>
#include <cstddef>
#include <cstdlib>
#include <cstring>

extern "C" void* __libc_malloc(std::size_t size);
extern "C" void* malloc(std::size_t size) noexcept;

namespace {

std::atomic<long> sCount = 0;

bool IsToFail(long count) {
    const char* const wanted = std::getenv("BRINDLE_FAILING_MALLOC");
    if (wanted == nullptr) return false;
    const long number = std::atol(wanted);
    const bool fails =
        count == number || (count > number && wanted[std::strlen(wanted) - 1] == '+');
    const char* const mark = std::getenv("BRINDLE_FAILED_MARK");
    if (fails && mark != nullptr) close(open(mark, O_CREAT | O_WRONLY, 0600));
    return fails;
}

}  // namespace

void* malloc(std::size_t size) noexcept {
    if (!IsToFail(++sCount)) return __libc_malloc(size);
    errno = ENOMEM;
    return nullptr;
}
