// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/MuxmlBlocks.h"

#include <string_view>

namespace brindle {

// What is drawn at a note besides its head. `mExists` tells whether the sign is there.

/// The accidental that is printed before a note, whatever the note sounds.
struct CMuxmlAccidental : CMuxmlXYColor, CMuxmlFont {
    bool mExists = false;  ///< the note has the element
    /// Undefined, too, for a word beyond the five, such as "quarter-flat".
    TMuxmlEnum_Accidental mValue = TMuxmlEnum_Accidental_Undef;
    /// Yes: it only reminds of what holds anyhow.
    TMuxmlEnum_YesNo mCautionary = TMuxmlEnum_YesNo_No;
    TMuxmlEnum_YesNo mEditorial = TMuxmlEnum_YesNo_No;    ///< yes: the editor added it
    TMuxmlEnum_YesNo mParentheses = TMuxmlEnum_YesNo_No;  ///< yes: between round brackets
    TMuxmlEnum_YesNo mBracket = TMuxmlEnum_YesNo_No;      ///< yes: between square brackets

    /// Reads `cautionary`, `editorial`, `parentheses`, `bracket`, and those of the blocks.
    void ReadFromAttributes(const CMuxmlAttributes& attributes);
    /// The sign from the text, and the attributes.
    void ReadFromFoundCharactersAndAttributes(std::string_view text,
                                              const CMuxmlAttributes& attributes);

    /// By name, see CMuxmlField.
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
    bool mExists = false;  ///< the note has the element
    /// Quarter, too, for an unknown word.
    TMuxmlEnum_NoteTypeValue mValue = TMuxmlEnum_NoteTypeValue_Quarter;
    /// Cue for a small note, whatever it sounds.
    TMuxmlEnum_SymbolSize mSize = TMuxmlEnum_SymbolSize_Full;

    /// Reads `size`.
    void ReadFromAttributes(const CMuxmlAttributes& attributes);
    /// The note value from the text, and the attribute.
    void ReadFromFoundCharactersAndAttributes(std::string_view text,
                                              const CMuxmlAttributes& attributes);

    /// By name, see CMuxmlField.
    static constexpr auto Fields() {
        return std::tuple(MuxmlField("mExists", &CMuxmlGraphicalNoteType::mExists),
                          MuxmlField("mValue", &CMuxmlGraphicalNoteType::mValue),
                          MuxmlField("mSize", &CMuxmlGraphicalNoteType::mSize));
    }
};

/// So many notes in the time of so many: 3 in the time of 2 for a triplet.
struct CMuxmlTimeModification {
    std::uint64_t mActualNotes = 0;  ///< that are played; 0 where the file tells none
    std::uint64_t mNormalNotes = 0;  ///< in the time of so many; 0 where it tells none
    /// Of which; undefined for those of the note itself.
    TMuxmlEnum_NoteTypeValue mNormalNoteType = TMuxmlEnum_NoteTypeValue_Undef;
    std::uint64_t mNormalNumberOfDots = 0;  ///< dots behind each of these

    /// Whether the note is played in another time than it is written in.
    [[nodiscard]] bool Exists() const { return mActualNotes != 0 && mNormalNotes != 0; }
    /// 3 in the time of 2 of its own kind.
    [[nodiscard]] bool IsPlainTriplet() const {
        return mActualNotes == 3 && mNormalNotes == 2 &&
               mNormalNoteType == TMuxmlEnum_NoteTypeValue_Undef && mNormalNumberOfDots == 0;
    }

    /// By name, see CMuxmlField.
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
    bool mExists = false;  ///< the note has the element
    /// Always above: the file tells the side by mType.
    TMuxmlEnum_AboveBelow mPlacement = TMuxmlEnum_AboveBelow_Above;
    /// A bow, an angle (short hold) or a square (long hold).
    TMuxmlEnum_FermataShape mShape = TMuxmlEnum_FermataShape_Normal;
    /// Inverted signs stand below the staff.
    TMuxmlEnum_UprightInverted mType = TMuxmlEnum_UprightInverted_Upright;

    /// Reads `type`, and those of the blocks.
    void ReadFromAttributes(const CMuxmlAttributes& attributes);
    /// The shape from the text, and the attributes.
    void ReadFromFoundCharactersAndAttributes(std::string_view text,
                                              const CMuxmlAttributes& attributes);

    /// By name, see CMuxmlField.
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
    bool mExists = false;                           ///< the file tells something about the stem
    TMuxmlEnum_Stem mValue = TMuxmlEnum_Stem_None;  ///< none, too, for an unknown word

    /// The direction from the text; place and colour.
    void ReadFromFoundCharactersAndAttributes(std::string_view text,
                                              const CMuxmlAttributes& attributes);

    /// By name, see CMuxmlField.
    static constexpr auto Fields() {
        return std::tuple(CMuxmlBlock<CMuxmlXYColor>{"CMuxmlXYColor"},
                          MuxmlField("mExists", &CMuxmlStem::mExists),
                          MuxmlField("mValue", &CMuxmlStem::mValue));
    }
};

/// A sign without a text, above or below its note.
struct CMuxmlNotationEmptyPlacement : CMuxmlXYColor, CMuxmlFont {
    bool mExists = false;  ///< the note has the element
    /// Above, too, where the file does not tell.
    TMuxmlEnum_AboveBelow mPlacement = TMuxmlEnum_AboveBelow_Above;

    /// Reads `placement`, and those of the blocks.
    void ReadFromAttributes(const CMuxmlAttributes& attributes);

    /// By name, see CMuxmlField.
    static constexpr auto Fields() {
        return std::tuple(CMuxmlBlock<CMuxmlXYColor>{"CMuxmlXYColor"},
                          CMuxmlBlock<CMuxmlFont>{"CMuxmlFont"},
                          MuxmlField("mExists", &CMuxmlNotationEmptyPlacement::mExists),
                          MuxmlField("mPlacement", &CMuxmlNotationEmptyPlacement::mPlacement));
    }
};

static_assert(MuxmlNamesAllFields<CMuxmlNotationEmptyPlacement>());

/// A wedge.
struct CMuxmlAccent : CMuxmlNotationEmptyPlacement {};
/// A comma behind the note.
struct CMuxmlBreathMark : CMuxmlNotationEmptyPlacement {};
/// Two strokes behind it.
struct CMuxmlCeasura : CMuxmlNotationEmptyPlacement {};
/// A line with a dot.
struct CMuxmlDetachedLegato : CMuxmlNotationEmptyPlacement {};
/// A steep wedge.
struct CMuxmlStrongAccent : CMuxmlNotationEmptyPlacement {};
/// A line.
struct CMuxmlTenuto : CMuxmlNotationEmptyPlacement {};
/// A dot.
struct CMuxmlStaccato : CMuxmlNotationEmptyPlacement {};
/// A drop.
struct CMuxmlStaccatissimo : CMuxmlNotationEmptyPlacement {};

/// A line that leads into the note or away from it.
struct CMuxmlArticulationEmptyLine : CMuxmlNotationEmptyPlacement, CMuxmlLine {
    /// Those of the sign and of its line.
    void ReadFromAttributes(const CMuxmlAttributes& attributes);

    /// By name, see CMuxmlField.
    static constexpr auto Fields() {
        return std::tuple_cat(CMuxmlNotationEmptyPlacement::Fields(),
                              std::tuple(CMuxmlBlock<CMuxmlLine>{"CMuxmlLine"}));
    }
};

/// Up, behind the note.
struct CMuxmlDoit : CMuxmlArticulationEmptyLine {};
/// Down, behind it.
struct CMuxmlFallOff : CMuxmlArticulationEmptyLine {};
/// Down into it.
struct CMuxmlPlop : CMuxmlArticulationEmptyLine {};
/// Up into it.
struct CMuxmlScoop : CMuxmlArticulationEmptyLine {};

}  // namespace brindle
