// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

/// Writes strict JSON as it is told, without a tree of it in memory: text of ASCII and UTF-8 that
/// people read, too. What fits on a line of 120 characters stands on a line, everything else is
/// broken into a line for each of its parts, two blanks further in.
///
///     CJsonWriter json;
///     json.BeginObject().Key("Chords").BeginArray();
///     for (...) json.String(symbol);
///     json.EndArray().EndObject();
///     std::string text = std::move(json).Text();
///
/// The caller keeps the order: in an object a key before each value, and every Begin ended. What
/// has been written is final, so that a megabyte of output needs a megabyte.
class CJsonWriter {
public:
    /// An object as the next value.
    CJsonWriter& BeginObject() { return Begin('{'); }
    /// The innermost open value, an object, is complete.
    CJsonWriter& EndObject() { return End('}'); }
    /// A list as the next value.
    CJsonWriter& BeginArray() { return Begin('['); }
    /// The innermost open value, a list, is complete.
    CJsonWriter& EndArray() { return End(']'); }
    /// The name of the next value of an object, escaped as a text is.
    CJsonWriter& Key(std::string_view name);

    /// What is undefined.
    CJsonWriter& Null() { return Scalar("null"); }
    /// true or false
    CJsonWriter& Bool(bool value) { return Scalar(value ? "true" : "false"); }
    /// All digits, which readers with floating numbers round beyond 2^53.
    CJsonWriter& Integer(std::int64_t value);
    CJsonWriter& Count(std::uint64_t value);  ///< the same for what may be beyond 2^63
    /// The shortest form that reads back as the same number, "1.0" for a whole one. Null for an
    /// infinite number, for no number and for an undefined position.
    CJsonWriter& Number(double value);
    /// Bytes that are no UTF-8 become U+FFFD.
    CJsonWriter& String(std::string_view text);
    /// Null for an empty text.
    CJsonWriter& StringOrNull(std::string_view text) {
        return text.empty() ? Null() : String(text);
    }

    /// The whole text, with an end of line behind it.
    [[nodiscard]] std::string Text() &&;

private:
    /// A list or an object that has not ended.
    struct CLevel {
        char mOpening = '[';
        std::size_t mCount = 0;
    };
    /// Where in the pending text a part of an open level begins, and where its key ends.
    struct CPart {
        std::size_t mLevel = 0;
        std::size_t mBegin = 0;
        std::size_t mKeyEnd = 0;
    };

    CJsonWriter& Begin(char opening);
    CJsonWriter& End(char closing);
    CJsonWriter& Scalar(std::string_view text);
    void BeginPart();
    void Append(std::string_view text);
    void BreakWhatIsTooLong();
    void BreakOutermost();
    void AppendMargin(std::size_t level);
    [[nodiscard]] bool IsPending() const { return mBrokenLevels < mLevels.size(); }

    std::string mText;
    // What may still stand on one line: from the opening of the outermost level that is not broken.
    std::string mPending;
    std::vector<CPart> mParts;
    std::vector<CLevel> mLevels;
    std::size_t mBrokenLevels = 0;
    bool mIsBehindKey = false;
};

/// The JSON of a writer without white space between its parts, and with an end of line.
[[nodiscard]] std::string JsonOnOneLine(std::string_view json);

}  // namespace brindle
