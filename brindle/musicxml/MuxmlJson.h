// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/CMuxmlBiMap.h"
#include "brindle/musicxml/MuxmlFields.h"
#include "brindle/platform/PlainText.h"
#include "brindle/platform/XmlDocument.h"

#include <cstdint>
#include <iosfwd>
#include <optional>
#include <set>
#include <string>
#include <string_view>
#include <tuple>
#include <type_traits>
#include <utility>
#include <vector>

namespace brindle {

/// How enumerations are written: by their word (their number where there is none), or by number.
enum TMuxmlEnumForm : std::int32_t {
    TMuxmlEnumForm_Word = 0,
    TMuxmlEnumForm_Number = 1,
};

/// Writes records of an import as strict JSON.
///
/// A record becomes an object of the fields that are not at their default, under the names of the
/// fields and in their order; blocks of fields and records inside are objects, too. A reference to
/// an element is left out, and a list of them is written as the number of its members.
class CMuxmlJson {
public:
    /// With words is for people, with numbers for what knows the enumerations.
    explicit CMuxmlJson(TMuxmlEnumForm form = TMuxmlEnumForm_Word) : mForm(form) {}

    /// The text of an object with all fields of the record.
    template <class Record>
    [[nodiscard]] std::string Object(const Record& record) const {
        std::string text = "{";
        AppendFields(text, record);
        return text += '}';
    }

    /// The fields of the record without braces; a comma before them unless the text ends with "{".
    template <class Record>
    void AppendFields(std::string& text, const Record& record) const {
        static_assert(MuxmlNamesAllFields<Record>());
        static const Record defaults{};
        std::apply([&](const auto&... field) { (AppendField(text, record, defaults, field), ...); },
                   Record::Fields());
    }

    // The values of fields

    /// True or false.
    static void Append(std::string& text, bool value);
    /// All digits, which readers with floating numbers round beyond 2^53.
    static void Append(std::string& text, std::int64_t value);
    /// Likewise.
    static void Append(std::string& text, std::uint64_t value);
    /// The fewest digits that read back the same; null where it is not finite.
    static void Append(std::string& text, double value);
    /// In quotes and escaped; bytes that are no UTF-8 become U+FFFD.
    static void Append(std::string& text, std::string_view value);

    /// Any value of a field by its type: records, enumerations, texts, numbers, lists, pairs and
    /// fractions (as lists of two).
    template <class Value>
    void AppendValue(std::string& text, const Value& value) const {
        if constexpr (MuxmlRecord<Value>) {
            text += Object(value);
        } else if constexpr (std::is_enum_v<Value>) {
            AppendEnum(text, value);
        } else if constexpr (std::is_same_v<Value, std::vector<XmlNode>>) {
            Append(text, std::uint64_t{value.size()});
        } else if constexpr (IsText<Value>) {
            Append(text, std::string_view(value));
        } else if constexpr (std::is_same_v<Value, bool>) {
            Append(text, value);
        } else if constexpr (std::is_floating_point_v<Value>) {
            Append(text, double{value});
        } else if constexpr (std::is_unsigned_v<Value>) {
            Append(text, std::uint64_t{value});
        } else if constexpr (std::is_integral_v<Value>) {
            Append(text, std::int64_t{value});
        } else if constexpr (requires { value.numerator(); }) {
            AppendList(text, std::tuple(value.numerator(), value.denominator()));
        } else if constexpr (requires { value.begin(); }) {
            AppendMembers(text, value);
        } else {
            AppendList(text, value);
        }
    }

private:
    template <class Value>
    static constexpr bool IsText = std::is_convertible_v<const Value&, std::string_view>;

    static void AppendName(std::string& text, std::string_view name);

    template <class Record, class Block>
    void AppendField(std::string& text, const Record& record, const Record&,
                     const CMuxmlBlock<Block>& field) const {
        AppendObject(text, field.mName, static_cast<const Block&>(record));
    }

    template <class Record, class Owner, class Value>
    void AppendField(std::string& text, const Record& record, const Record& defaults,
                     const CMuxmlField<Owner, Value>& field) const {
        const Value& value = record.*field.mMember;
        if constexpr (MuxmlRecord<Value>) {
            AppendObject(text, field.mName, value);
        } else if constexpr (requires { value.size(); }) {
            if (value.size() == 0 && (defaults.*field.mMember).size() == 0) return;
            if constexpr (IsText<Value>) {
                if (value == defaults.*field.mMember) return;
            }
            AppendName(text, field.mName);
            AppendValue(text, value);
        } else if constexpr (!std::is_same_v<Value, XmlNode>) {
            if (value == defaults.*field.mMember) return;
            AppendName(text, field.mName);
            AppendValue(text, value);
        }
    }

    template <class Record>
    void AppendObject(std::string& text, std::string_view name, const Record& record) const {
        std::string object = Object(record);
        if (object == "{}") return;
        AppendName(text, name);
        text += object;
    }

    template <class Enumeration>
    void AppendEnum(std::string& text, Enumeration value) const {
        const auto word = mBiMap<Enumeration>.WordOf(value);
        if (mForm == TMuxmlEnumForm_Word && word) {
            Append(text, *word);
        } else {
            Append(text, static_cast<std::int64_t>(value));
        }
    }

    template <class Tuple>
    void AppendList(std::string& text, const Tuple& values) const {
        text += '[';
        std::apply(
            [&](const auto& first, const auto&... others) {
                AppendValue(text, first);
                ((text += ',', AppendValue(text, others)), ...);
            },
            values);
        text += ']';
    }

    template <class List>
    void AppendMembers(std::string& text, const List& list) const {
        text += '[';
        bool isFirst = true;
        for (const auto& member : list) {
            if (!std::exchange(isFirst, false)) text += ',';
            AppendValue(text, member);
        }
        text += ']';
    }

    TMuxmlEnumForm mForm;
};

/// Records print as JSON with words.
template <MuxmlRecord Record>
std::ostream& operator<<(std::ostream& stream, const Record& record) {
    PlainText::Write(stream, CMuxmlJson().Object(record));
    return stream;
}

}  // namespace brindle
