// SPDX-License-Identifier: MIT
#include "brindle/platform/Random.h"

#include <cstdlib>
#include <random>

// The GNU C library has arc4random from 2.36 on.
#if defined(__APPLE__) || defined(__FreeBSD__) || defined(__OpenBSD__) || defined(__NetBSD__)
#define BRINDLE_HAS_ARC4RANDOM 1
#elif defined(__GLIBC__)
#if __GLIBC_PREREQ(2, 36)
#define BRINDLE_HAS_ARC4RANDOM 1
#endif
#endif

namespace brindle {

std::uint32_t RandomBits() {
#ifdef BRINDLE_HAS_ARC4RANDOM
    return arc4random();
#else
    static thread_local std::random_device device;
    return device();
#endif
}

}  // namespace brindle
