// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/MuxmlBlocks.h"

#include <string_view>

namespace brindle {

// What is drawn at a note besides its head. `mExists` tells whether the sign is there.

/// The accidental that is printed before a note, whatever the note sounds.
struct CMuxmlAccidental : CMuxmlXYColor, CMuxmlFont {
    bool mExists = false;
    TMuxmlEnum_Accidental mValue = TMuxmlEnum_Accidental_Undef;
    TMuxmlEnum_YesNo mCautionary = TMuxmlEnum_YesNo_No;
    TMuxmlEnum_YesNo mEditorial = TMuxmlEnum_YesNo_No;
    TMuxmlEnum_YesNo mParentheses = TMuxmlEnum_YesNo_No;
    TMuxmlEnum_YesNo mBracket = TMuxmlEnum_YesNo_No;

    void ReadFromAttributes(const CMuxmlAttributes& attributes);
    void ReadFromFoundCharactersAndAttributes(std::string_view text,
                                              const CMuxmlAttributes& attributes);

    static constexpr auto Fields() {
        return std::tuple(CMuxmlBlock<CMuxmlXYColor>{"CMuxmlXYColor"},
                          CMuxmlBlock<CMuxmlFont>{"CMuxmlFont"},
                          MuxmlField("mExists", &CMuxmlAccidental::mExists),
                          MuxmlField("mValue", &CMuxmlAccidental::mValue),
                          MuxmlField("mCautionary", &CMuxmlAccidental::mCautionary),
                          MuxmlField("mEditorial", &CMuxmlAccidental::mEditorial),
                          MuxmlField("mParentheses", &CMuxmlAccidental::mParentheses),
                          MuxmlField("mBracket", &CMuxmlAccidental::mBracket));
    }
};

/// How long the note looks; its length in time is told elsewhere.
struct CMuxmlGraphicalNoteType {
    bool mExists = false;
    TMuxmlEnum_NoteTypeValue mValue = TMuxmlEnum_NoteTypeValue_Quarter;
    TMuxmlEnum_SymbolSize mSize = TMuxmlEnum_SymbolSize_Full;

    void ReadFromAttributes(const CMuxmlAttributes& attributes);
    void ReadFromFoundCharactersAndAttributes(std::string_view text,
                                              const CMuxmlAttributes& attributes);

    static constexpr auto Fields() {
        return std::tuple(MuxmlField("mExists", &CMuxmlGraphicalNoteType::mExists),
                          MuxmlField("mValue", &CMuxmlGraphicalNoteType::mValue),
                          MuxmlField("mSize", &CMuxmlGraphicalNoteType::mSize));
    }
};

/// So many notes in the time of so many: 3 in the time of 2 for a triplet.
struct CMuxmlTimeModification {
    std::uint64_t mActualNotes = 0;
    std::uint64_t mNormalNotes = 0;
    TMuxmlEnum_NoteTypeValue mNormalNoteType = TMuxmlEnum_NoteTypeValue_Undef;
    std::uint64_t mNormalNumberOfDots = 0;

    /// Whether the note is played in another time than it is written in.
    [[nodiscard]] bool Exists() const { return mActualNotes != 0 && mNormalNotes != 0; }
    [[nodiscard]] bool IsPlainTriplet() const {
        return mActualNotes == 3 && mNormalNotes == 2 &&
               mNormalNoteType == TMuxmlEnum_NoteTypeValue_Undef && mNormalNumberOfDots == 0;
    }

    static constexpr auto Fields() {
        return std::tuple(
            MuxmlField("mActualNotes", &CMuxmlTimeModification::mActualNotes),
            MuxmlField("mNormalNotes", &CMuxmlTimeModification::mNormalNotes),
            MuxmlField("mNormalNoteType", &CMuxmlTimeModification::mNormalNoteType),
            MuxmlField("mNormalNumberOfDots", &CMuxmlTimeModification::mNormalNumberOfDots));
    }
};

/// A fermata: the note is held as long as the player likes.
struct CMuxmlFermata : CMuxmlXYColor, CMuxmlFont {
    bool mExists = false;
    TMuxmlEnum_AboveBelow mPlacement = TMuxmlEnum_AboveBelow_Above;
    TMuxmlEnum_FermataShape mShape = TMuxmlEnum_FermataShape_Normal;
    TMuxmlEnum_UprightInverted mType = TMuxmlEnum_UprightInverted_Upright;

    void ReadFromAttributes(const CMuxmlAttributes& attributes);
    void ReadFromFoundCharactersAndAttributes(std::string_view text,
                                              const CMuxmlAttributes& attributes);

    static constexpr auto Fields() {
        return std::tuple(CMuxmlBlock<CMuxmlXYColor>{"CMuxmlXYColor"},
                          CMuxmlBlock<CMuxmlFont>{"CMuxmlFont"},
                          MuxmlField("mExists", &CMuxmlFermata::mExists),
                          MuxmlField("mPlacement", &CMuxmlFermata::mPlacement),
                          MuxmlField("mShape", &CMuxmlFermata::mShape),
                          MuxmlField("mType", &CMuxmlFermata::mType));
    }
};

/// The stem of a note and the way it points.
struct CMuxmlStem : CMuxmlXYColor {
    bool mExists = false;
    TMuxmlEnum_Stem mValue = TMuxmlEnum_Stem_None;

    void ReadFromFoundCharactersAndAttributes(std::string_view text,
                                              const CMuxmlAttributes& attributes);

    static constexpr auto Fields() {
        return std::tuple(CMuxmlBlock<CMuxmlXYColor>{"CMuxmlXYColor"},
                          MuxmlField("mExists", &CMuxmlStem::mExists),
                          MuxmlField("mValue", &CMuxmlStem::mValue));
    }
};

/// A sign without a text, above or below its note.
struct CMuxmlNotationEmptyPlacement : CMuxmlXYColor, CMuxmlFont {
    bool mExists = false;
    TMuxmlEnum_AboveBelow mPlacement = TMuxmlEnum_AboveBelow_Above;

    void ReadFromAttributes(const CMuxmlAttributes& attributes);

    static constexpr auto Fields() {
        return std::tuple(CMuxmlBlock<CMuxmlXYColor>{"CMuxmlXYColor"},
                          CMuxmlBlock<CMuxmlFont>{"CMuxmlFont"},
                          MuxmlField("mExists", &CMuxmlNotationEmptyPlacement::mExists),
                          MuxmlField("mPlacement", &CMuxmlNotationEmptyPlacement::mPlacement));
    }
};

static_assert(MuxmlNamesAllFields<CMuxmlNotationEmptyPlacement>());

struct CMuxmlAccent : CMuxmlNotationEmptyPlacement {};
struct CMuxmlBreathMark : CMuxmlNotationEmptyPlacement {};
struct CMuxmlCeasura : CMuxmlNotationEmptyPlacement {};
struct CMuxmlDetachedLegato : CMuxmlNotationEmptyPlacement {};
struct CMuxmlStrongAccent : CMuxmlNotationEmptyPlacement {};
struct CMuxmlTenuto : CMuxmlNotationEmptyPlacement {};
struct CMuxmlStaccato : CMuxmlNotationEmptyPlacement {};
struct CMuxmlStaccatissimo : CMuxmlNotationEmptyPlacement {};

/// A line that leads into the note or away from it.
struct CMuxmlArticulationEmptyLine : CMuxmlNotationEmptyPlacement, CMuxmlLine {
    void ReadFromAttributes(const CMuxmlAttributes& attributes);

    static constexpr auto Fields() {
        return std::tuple_cat(CMuxmlNotationEmptyPlacement::Fields(),
                              std::tuple(CMuxmlBlock<CMuxmlLine>{"CMuxmlLine"}));
    }
};

struct CMuxmlDoit : CMuxmlArticulationEmptyLine {};
struct CMuxmlFallOff : CMuxmlArticulationEmptyLine {};
struct CMuxmlPlop : CMuxmlArticulationEmptyLine {};
struct CMuxmlScoop : CMuxmlArticulationEmptyLine {};

}  // namespace brindle
