// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/TEnh.h"

#include <array>
#include <iosfwd>
#include <nlohmann/json_fwd.hpp>
#include <string>
#include <string_view>

namespace brindle {

struct CChordNamePrefs;

/// Key number of no key. Real key numbers are 0 (C) to 11 (B): pitch classes, the keys of a
/// keyboard in any octave.
inline constexpr int kKeyNrUndef = 15;

/// Whether the key is one of the five black keys. 15 is not tested: its remainder by 12 is 3, so it
/// counts as black. A negative number counts as white.
[[nodiscard]] constexpr bool IsBlackKey(int keyNr) {
    constexpr unsigned kBlackKeys = 0x54A;  // 1 3 6 8 10
    const int remainder = keyNr % 12;
    return remainder >= 0 && (kBlackKeys >> remainder & 1U) != 0;
}
/// The opposite of IsBlackKey.
[[nodiscard]] constexpr bool IsWhiteKey(int keyNr) {
    return !IsBlackKey(keyNr);
}

/// A pitch class together with its spelling: C sharp and D flat are one key, two CKeyEnh. They are
/// enharmonic.
///
/// The fields are not checked against each other; HasSensefulEnh tells whether the pair can be
/// written down.
struct CKeyEnh {
    int mKeyNr = kKeyNrUndef;  ///< the key, 0 (C) to 11 (B), in no octave
    TEnh mEnh = TEnh_Undef;    ///< how it is written

    /// True when the key is 15, whatever the spelling.
    [[nodiscard]] constexpr bool IsUndef() const { return mKeyNr == kKeyNrUndef; }

    /// As the free functions, so the undefined key counts as black.
    [[nodiscard]] constexpr bool IsBlackKey() const { return brindle::IsBlackKey(mKeyNr); }
    /// The opposite of IsBlackKey.
    [[nodiscard]] constexpr bool IsWhiteKey() const { return brindle::IsWhiteKey(mKeyNr); }
    /// Whether one of the seven letters with this accidental is this key.
    [[nodiscard]] bool HasSensefulEnh() const;

    /// Moves the key by an interval in semitones, negative for down, and spells the result as a
    /// musician would where it can: a third up from a flat key stays flat. An interval of whole
    /// octaves changes nothing, and nothing moves the undefined key.
    void AddToThis(int intvl);
    /// This key moved by AddToThis.
    [[nodiscard]] CKeyEnh Add(int intvl) const;
    /// The same as Add.
    [[nodiscard]] CKeyEnh operator+(int intvl) const { return Add(intvl); }
    /// This key moved by the negated interval.
    [[nodiscard]] CKeyEnh operator-(int intvl) const;

    /// Reads a key name at the start of `text`: leading blanks, a letter A to H in either case, and
    /// "#", "is", "x", "b" or "bb" behind it. The signs U+266F and U+266D read as "#" and "b".
    /// Without such a letter the key becomes undefined.
    ///
    /// `consumed`, if given, receives the count of characters used, leading blanks included and a
    /// sign counted as one; 0 when there is no key.
    void SetFromString(std::string_view text, int* consumed, const CChordNamePrefs& prefs);

    /// The text that makes this key in code: "CKeyEnh(3, TEnh_b)".
    [[nodiscard]] std::string StringForInitializerList() const;

    /// Writes `{"KeyNr":" 7","Enh":"neutral"}`, the number two places wide.
    void AppendJSONString(std::ostream& stream) const;

    /// The names of its members in JSON, and the reader of them.
    struct JSONDeserializer_Helper {
        /// Where others hold a key.
        static constexpr const char* CKeyEnhJSONKey_CKeyEnh = "CKeyEnh";
        static constexpr const char* CKeyEnhJSONKey_KeyNr = "KeyNr";  ///< the number, a text
        static constexpr const char* CKeyEnhJSONKey_Enh = "Enh";      ///< the spelling, a word

        /// Reads what AppendJSONString wrote; a missing field is undefined, and so is a key number
        /// that is no key or a value of the wrong type. The number may be a JSON number too.
        static CKeyEnh CKeyEnhFromJSONDictionary(const nlohmann::json& dictionary);
    };

    friend constexpr bool operator==(const CKeyEnh&, const CKeyEnh&) = default;
    /// By key number; at equal key number the larger spelling value comes first.
    friend constexpr bool operator<(const CKeyEnh& a, const CKeyEnh& b) {
        return a.mKeyNr != b.mKeyNr ? a.mKeyNr < b.mKeyNr : a.mEnh > b.mEnh;
    }
};

/// Writes key number and spelling, for debugging.
std::ostream& operator<<(std::ostream& stream, const CKeyEnh& keyEnh);

/// No key: number 15, no spelling.
inline constexpr CKeyEnh CKeyEnh_Undef{};

// Every spelling by name: `is` sharp, `b` flat, `bb` double flat, `x` double sharp, `xs` triple
// sharp, `bbb` triple flat.
inline constexpr CKeyEnh CKeyEnh_Cbbb{9, TEnh_bbb};  ///< C triple flat, the key A
inline constexpr CKeyEnh CKeyEnh_Cbb{10, TEnh_bb};   ///< C double flat, the key B flat
inline constexpr CKeyEnh CKeyEnh_Cb{11, TEnh_b};     ///< C flat, the key B
inline constexpr CKeyEnh CKeyEnh_C{0, TEnh_n};       ///< C, key 0
inline constexpr CKeyEnh CKeyEnh_Cis{1, TEnh_s};     ///< C sharp, key 1
inline constexpr CKeyEnh CKeyEnh_Cx{2, TEnh_ss};     ///< C double sharp, the key D
inline constexpr CKeyEnh CKeyEnh_Cxs{3, TEnh_sss};   ///< C triple sharp, the key E flat

inline constexpr CKeyEnh CKeyEnh_Dbbb{11, TEnh_bbb};  ///< D triple flat, the key B
inline constexpr CKeyEnh CKeyEnh_Dbb{0, TEnh_bb};     ///< D double flat, the key C
inline constexpr CKeyEnh CKeyEnh_Db{1, TEnh_b};       ///< D flat, key 1
inline constexpr CKeyEnh CKeyEnh_D{2, TEnh_n};        ///< D, key 2
inline constexpr CKeyEnh CKeyEnh_Dis{3, TEnh_s};      ///< D sharp, key 3
inline constexpr CKeyEnh CKeyEnh_Dx{4, TEnh_ss};      ///< D double sharp, the key E
inline constexpr CKeyEnh CKeyEnh_Dxs{5, TEnh_sss};    ///< D triple sharp, the key F

inline constexpr CKeyEnh CKeyEnh_Ebbb{1, TEnh_bbb};  ///< E triple flat, the key C sharp
inline constexpr CKeyEnh CKeyEnh_Ebb{2, TEnh_bb};    ///< E double flat, the key D
inline constexpr CKeyEnh CKeyEnh_Eb{3, TEnh_b};      ///< E flat, key 3
inline constexpr CKeyEnh CKeyEnh_E{4, TEnh_n};       ///< E, key 4
inline constexpr CKeyEnh CKeyEnh_Eis{5, TEnh_s};     ///< E sharp, the key F
inline constexpr CKeyEnh CKeyEnh_Ex{6, TEnh_ss};     ///< E double sharp, the key F sharp
inline constexpr CKeyEnh CKeyEnh_Exs{7, TEnh_sss};   ///< E triple sharp, the key G

inline constexpr CKeyEnh CKeyEnh_Fbbb{2, TEnh_bbb};  ///< F triple flat, the key D
inline constexpr CKeyEnh CKeyEnh_Fbb{3, TEnh_bb};    ///< F double flat, the key E flat
inline constexpr CKeyEnh CKeyEnh_Fb{4, TEnh_b};      ///< F flat, the key E
inline constexpr CKeyEnh CKeyEnh_F{5, TEnh_n};       ///< F, key 5
inline constexpr CKeyEnh CKeyEnh_Fis{6, TEnh_s};     ///< F sharp, key 6
inline constexpr CKeyEnh CKeyEnh_Fx{7, TEnh_ss};     ///< F double sharp, the key G
inline constexpr CKeyEnh CKeyEnh_Fxs{8, TEnh_sss};   ///< F triple sharp, the key A flat

inline constexpr CKeyEnh CKeyEnh_Gbbb{4, TEnh_bbb};  ///< G triple flat, the key E
inline constexpr CKeyEnh CKeyEnh_Gbb{5, TEnh_bb};    ///< G double flat, the key F
inline constexpr CKeyEnh CKeyEnh_Gb{6, TEnh_b};      ///< G flat, key 6
inline constexpr CKeyEnh CKeyEnh_G{7, TEnh_n};       ///< G, key 7
inline constexpr CKeyEnh CKeyEnh_Gis{8, TEnh_s};     ///< G sharp, key 8
inline constexpr CKeyEnh CKeyEnh_Gx{9, TEnh_ss};     ///< G double sharp, the key A
inline constexpr CKeyEnh CKeyEnh_Gxs{10, TEnh_sss};  ///< G triple sharp, the key B flat

inline constexpr CKeyEnh CKeyEnh_Abbb{6, TEnh_bbb};  ///< A triple flat, the key F sharp
inline constexpr CKeyEnh CKeyEnh_Abb{7, TEnh_bb};    ///< A double flat, the key G
inline constexpr CKeyEnh CKeyEnh_Ab{8, TEnh_b};      ///< A flat, key 8
inline constexpr CKeyEnh CKeyEnh_A{9, TEnh_n};       ///< A, key 9
inline constexpr CKeyEnh CKeyEnh_Ais{10, TEnh_s};    ///< A sharp, key 10
inline constexpr CKeyEnh CKeyEnh_Ax{11, TEnh_ss};    ///< A double sharp, the key B
inline constexpr CKeyEnh CKeyEnh_Axs{0, TEnh_sss};   ///< A triple sharp, the key C

inline constexpr CKeyEnh CKeyEnh_Bbbb{8, TEnh_bbb};  ///< B triple flat, the key A flat
inline constexpr CKeyEnh CKeyEnh_Bbb{9, TEnh_bb};    ///< B double flat, the key A
inline constexpr CKeyEnh CKeyEnh_Bb{10, TEnh_b};     ///< B flat, key 10
inline constexpr CKeyEnh CKeyEnh_B{11, TEnh_n};      ///< B, key 11
inline constexpr CKeyEnh CKeyEnh_Bis{0, TEnh_s};     ///< B sharp, the key C
inline constexpr CKeyEnh CKeyEnh_Bx{1, TEnh_ss};     ///< B double sharp, the key C sharp
inline constexpr CKeyEnh CKeyEnh_Bxs{2, TEnh_sss};   ///< B triple sharp, the key D

/// The 21 spellings with at most one accidental, upwards from C.
inline constexpr std::array<CKeyEnh, 21> CKeyEnh_AllUpToOneAccidental{
    CKeyEnh_C,   CKeyEnh_Cis, CKeyEnh_Db,  CKeyEnh_D,   CKeyEnh_Dis, CKeyEnh_Eb,  CKeyEnh_E,
    CKeyEnh_Eis, CKeyEnh_Fb,  CKeyEnh_F,   CKeyEnh_Fis, CKeyEnh_Gb,  CKeyEnh_G,   CKeyEnh_Gis,
    CKeyEnh_Ab,  CKeyEnh_A,   CKeyEnh_Ais, CKeyEnh_Bb,  CKeyEnh_B,   CKeyEnh_Bis, CKeyEnh_Cb,
};

}  // namespace brindle
