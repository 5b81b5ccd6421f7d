// SPDX-License-Identifier: MIT
#pragma once

#include "cli/CommandLine.h"
#include "cli/NamingOptions.h"
#include "cli/NotesText.h"

#include "brindle/chords/NameNotes.h"

#include <string>
#include <vector>

namespace brindle::cli {

/// What `name` was asked for.
struct CNameOptions {
    std::vector<std::string> mWords;
    std::string mMethod = "notes";
    std::string mKey;
    std::string mBefore;
    std::string mAfter;
    std::string mBass = "usual";
    std::string mRoot;
    int mCandidates = 1;
    bool mAllRoots = false;
    bool mProgression = false;
    bool mIsExact = false;
    ::brindle::CNamingOptions mContext;  // of the words above, but the limit
    CKeyEnh mRootKey;                    // of mRoot
    cli::CNamingOptions mNaming;
    CFormatOptions mFormat;
};

// The output of `name` for sets of notes.

/// By how common chords are.
[[nodiscard]] std::string NameAsPlayed(const std::vector<CNotesText>& sets,
                                       const CNameOptions& options);

/// By a search for the root, "net" or "score", and the name of the chord over it.
[[nodiscard]] std::string NameByRoot(const std::vector<CNotesText>& sets,
                                     const CNameOptions& options);

}  // namespace brindle::cli
