// SPDX-License-Identifier: MIT
#pragma once

namespace brindle::cli {

/// While it lives, Ctrl-C and the signals that ask to end only make a mark, so that work can end
/// where its output is whole. The second one ends the program as always. One at a time.
class CInterrupt {
public:
    CInterrupt();
    CInterrupt(const CInterrupt&) = delete;
    CInterrupt& operator=(const CInterrupt&) = delete;
    ~CInterrupt();

    [[nodiscard]] bool IsAsked() const;
    /// Ends the program by the signal that asked, so that who waits for it sees that; returns if
    /// none did.
    void EndIfAsked() const;
};

}  // namespace brindle::cli
