// SPDX-License-Identifier: MIT
#include "brindle/neural/NameOverRoots.h"

#include <doctest/doctest.h>

#include <algorithm>
#include <set>

using namespace brindle;

namespace {

CMySet<CNote> NotesFrom(std::int64_t lowest, std::initializer_list<std::int64_t> intvls) {
    CMySet<CNote> notes;
    for (const std::int64_t intvl : intvls) notes.insert(CNote(lowest + intvl, TEnh_n));
    return notes;
}

}  // namespace

TEST_CASE("An inversion is named over its root, a foreign bass behind a slash") {
    struct CRow {
        CMySet<CNote> mNotes;
        const char* mName;
    };
    const CRow rows[] = {
        {NotesFrom(60, {0, 4, 7}), "C"},
        {NotesFrom(52, {0, 3, 8}), "C/E"},
        {NotesFrom(55, {0, 5, 9, 15}), "C7/G"},
        {NotesFrom(46, {0, 14, 18, 21}), "C/Bb"},
    };
    for (const CRow& row : rows) {
        CNameOverRootOptions options;
        options.mRoot = {0, TEnh_n};
        options.mPrefs.mNoSpaceBetweenNameParts = 1;
        options.mPrefs.mNoSpaceAroundSlash = 1;
        options.mPrefs.mOmitBassOption = true;
        options.mPrefs.mChordPrefB = false;  // show the bass within an octave, too
        const auto names = NameOverRoots(row.mNotes, options);
        REQUIRE(names.size() == 1);
        CHECK(names.front().mName == row.mName);
        CHECK(names.front().mIsSounding);
    }
}

TEST_CASE("Notes at both ends of the keyboard have the names of those in its middle") {
    for (std::int64_t root = 0; root < 12; ++root) {
        const std::int64_t high = 108 + root;
        const auto middle = NameOverRoots(NotesFrom(60 + root, {0, 4, 7}));
        CHECK(NameOverRoots(NotesFrom(root, {0, 4, 7})).front().mName == middle.front().mName);
        CHECK(NameOverRoots(NotesFrom(high, {0, 4, 7})).front().mName == middle.front().mName);
    }
}

TEST_CASE("Every root has a name, and those that sound come first") {
    CNameOverRootOptions options;
    options.mAllRoots = true;
    const auto names = NameOverRoots(NotesFrom(60, {0, 4, 7, 10}), options);
    REQUIRE(names.size() == 12);
    std::set<int> roots;
    for (const CChordOverRoot& name : names) roots.insert(name.mRoot.mKeyNr);
    CHECK(roots.size() == 12);
    CHECK(std::is_partitioned(names.begin(), names.end(),
                              [](const CChordOverRoot& name) { return name.mIsSounding; }));
    CHECK(std::count_if(names.begin(), names.end(),
                        [](const CChordOverRoot& name) { return name.mIsSounding; }) == 4);
}
