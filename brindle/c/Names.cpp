// SPDX-License-Identifier: MIT
#include "brindle/c/internal/Border.h"
#include "brindle/c/internal/Values.h"

#include "brindle/chords/NameNotes.h"

#include <memory>
#include <vector>

using namespace brindle::border;

struct brindle_names {
    std::vector<brindle::CNamedChord> mNames;
};

namespace {

// No keyboard has more notes.
constexpr int kHighestNote = 127;

bool IsRootOrNone(int root) {
    return root == BRINDLE_NONE || (root >= 0 && root < 12);
}

// What is wrong with options; null if nothing is.
const char* FaultOf(const brindle_naming_options& options) {
    if (IsRootOrNone(options.previous_root) && IsRootOrNone(options.next_root)) return nullptr;
    return "a root is 0 to 11, or BRINDLE_NONE";
}

brindle::CNamingOptions FromC(const brindle_naming_options& options) {
    const auto rootOf = [](int root) { return root == BRINDLE_NONE ? brindle::kKeyNrUndef : root; };
    brindle::CNamingOptions result;
    result.mKey = brindle::border::FromC(options.key);
    result.mPreviousRoot = rootOf(options.previous_root);
    result.mNextRoot = rootOf(options.next_root);
    if (options.bass == BRINDLE_BASS_ONLY) result.mBass = brindle::TBassUse::Only;
    if (options.bass == BRINDLE_BASS_NONE) result.mBass = brindle::TBassUse::None;
    result.mLimit = options.limit;
    return result;
}

// False for a number that is no note.
bool ReadNotes(const int* numbers, size_t count, std::vector<brindle::CNote>& notes) {
    for (size_t i = 0; i < count; ++i) {
        if (numbers[i] < 0 || numbers[i] > kHighestNote) return false;
        notes.emplace_back(numbers[i], brindle::TEnh_Undef);
    }
    return true;
}

}  // namespace

brindle_naming_options brindle_naming_options_default(void) {
    const brindle::CNamingOptions usual;
    return {ToC(brindle::CSignKeyLite()), BRINDLE_NONE, BRINDLE_NONE, BRINDLE_BASS_USUAL,
            usual.mLimit};
}

brindle_status brindle_names_of_notes(const int* notes, size_t count,
                                      const brindle_naming_options* options,
                                      brindle_names** names) {
    if (names == nullptr) return FailForNull("names");
    *names = nullptr;
    if (notes == nullptr && count > 0) return FailForNull("notes");
    return Guarded([&] {
        const auto used = options != nullptr ? *options : brindle_naming_options_default();
        if (const char* const fault = FaultOf(used)) return Fail(BRINDLE_ERROR_ARGUMENT, fault);
        std::vector<brindle::CNote> read;
        if (!ReadNotes(notes, count, read)) {
            return Fail(BRINDLE_ERROR_ARGUMENT, "a note is a number of 0 to 127");
        }
        auto result = std::make_unique<brindle_names>();
        result->mNames = NameNotes(read, FromC(used));
        *names = result.release();
        return BRINDLE_OK;
    });
}

void brindle_names_free(brindle_names* names) {
    delete names;
}

size_t brindle_names_count(const brindle_names* names) {
    return names == nullptr ? 0 : names->mNames.size();
}

brindle_status brindle_names_get(const brindle_names* names, size_t index, brindle_name* name) {
    if (name == nullptr) return FailForNull("name");
    *name = {"", "", ToC(brindle::CChordLite()), 0};
    if (names == nullptr) return FailForNull("names");
    ForgetFault();
    if (index >= names->mNames.size()) return FailForIndex(index, names->mNames.size());
    const brindle::CNamedChord& named = names->mNames[index];
    *name = {named.mSymbol.c_str(), named.mExactSymbol.c_str(), ToC(named.mChord), named.mCost};
    return BRINDLE_OK;
}
