// SPDX-License-Identifier: MIT
#include "ArrowColumn.h"
#include "Bind.h"
#include "SourceSong.h"

#include "brindle/chords/CChordLite.h"
#include "brindle/platform/WorkInParallel.h"
#include "brindle/present/PrintableSong.h"
#include "brindle/present/ShownNames.h"
#include "brindle/song/ReadSongHarmony.h"

#include <nanobind/nanobind.h>
#include <nanobind/stl/string.h>

#include <algorithm>
#include <chrono>
#include <optional>
#include <string_view>
#include <vector>

namespace brindle::python {

namespace nb = nanobind;

namespace {

/// A row of the table: a song with its reading, or nothing for a song that is none.
struct CSongRow {
    CSong mSong;
    CSongReading mReading;
};

using CTexts = std::vector<std::optional<std::string_view>>;

CSongRow RowOf(std::string_view text, const CSongOptions& options) {
    CSongRow row;
    row.mSong = ReadSong(text, options);
    MakePrintable(row.mSong);
    row.mReading = ReadSongHarmony(row.mSong);
    // What the columns do not hold is not kept until they are filled.
    row.mSong.mBars.clear();
    row.mSong.mBars.shrink_to_fit();
    return row;
}

// More are of no use to anybody.
constexpr std::size_t kMostThreads = 256;

enum TChordField {
    kPosition,
    kLength,
    kSymbol,
    kRoot,
    kMask,
    kNumeral,
    kFunction,
    kRelation,
    kKey
};

CArrowColumn ChordsColumn() {
    std::vector<CArrowColumn> fields;
    fields.emplace_back("position", "g");
    fields.emplace_back("length", "g");
    fields.emplace_back("symbol", "u");
    fields.emplace_back("root", "c");
    fields.emplace_back("mask", "s");
    fields.emplace_back("numeral", "u");
    fields.emplace_back("function", "u");
    fields.emplace_back("relation", "u");
    fields.emplace_back("key", "u");
    return {"chords", "+l", {CArrowColumn("item", "+s", std::move(fields))}};
}

CArrowColumn FaultsColumn() {
    std::vector<CArrowColumn> fields;
    fields.emplace_back("line", "i");
    fields.emplace_back("column", "i");
    fields.emplace_back("text", "u");
    fields.emplace_back("is_note", "b");
    return {"faults", "+l", {CArrowColumn("item", "+s", std::move(fields))}};
}

enum TSongField { kSongTitle, kSongKey, kSongConfidence, kSongChords, kSongFaults };

CArrowColumn SongsTable() {
    std::vector<CArrowColumn> columns;
    columns.emplace_back("title", "u");
    columns.emplace_back("key", "u");
    columns.emplace_back("confidence", "g");
    columns.push_back(ChordsColumn());
    columns.push_back(FaultsColumn());
    return {"", "+s", std::move(columns)};
}

void AddKey(CArrowColumn& column, const CSignKeyLite& key) {
    if (key.IsUndef()) {
        column.AddNull();
    } else {
        column.AddText(key.NameLong(NamePrefs()));
    }
}

void AddChord(CArrowColumn& chords, const CSongRow& row, std::size_t index) {
    const auto& chord = row.mSong.mChords[index];
    const CChordReading& reading = row.mReading.mChords[index];
    chords.Child(kPosition).AddNumber(chord.mPosition);
    chords.Child(kLength).AddNumber(LengthOfChord(row.mSong, index));
    chords.Child(kSymbol).AddText(SymbolOfChord(row.mSong, index));
    if (chord.IsUndef()) {
        chords.Child(kRoot).AddNull();
        chords.Child(kMask).AddNull();
    } else {
        chords.Child(kRoot).AddNumber(static_cast<std::int8_t>(chord.mRootKeyEnh.mKeyNr));
        chords.Child(kMask).AddNumber(static_cast<std::int16_t>(chord.mSemitones.Mask()));
    }
    chords.Child(kNumeral).AddText(reading.mNumeral);
    chords.Child(kFunction).AddText(NameOf(reading.mFunction));
    chords.Child(kRelation).AddText(NameOf(reading.mRelation));
    AddKey(chords.Child(kKey), reading.mKey);
    chords.AddRecord();
}

void AddFault(CArrowColumn& faults, const CSongFault& fault) {
    faults.Child(0).AddNumber(static_cast<std::int32_t>(fault.mLine));
    faults.Child(1).AddNumber(static_cast<std::int32_t>(fault.mColumn));
    faults.Child(2).AddText(fault.mText);
    faults.Child(3).AddFlag(fault.mIsNote);
    faults.AddRecord();
}

void AddSong(CArrowColumn& table, const CSongRow& row) {
    table.Child(kSongTitle).AddText(row.mSong.mTitle);
    AddKey(table.Child(kSongKey), row.mReading.mKey);
    if (row.mReading.mKey.IsUndef()) {
        table.Child(kSongConfidence).AddNull();
    } else {
        table.Child(kSongConfidence).AddNumber(row.mReading.mConfidence);
    }
    CArrowColumn& chords = table.Child(kSongChords);
    for (std::size_t i = 0; i < ChordCount(row.mSong); ++i) AddChord(chords.Child(0), row, i);
    chords.AddList();
    CArrowColumn& faults = table.Child(kSongFaults);
    for (const CSongFault& fault : row.mSong.mFaults) AddFault(faults.Child(0), fault);
    faults.AddList();
    table.AddRecord();
}

void AddNoSong(CArrowColumn& table) {
    for (int column = kSongTitle; column <= kSongFaults; ++column) {
        table.Child(static_cast<std::size_t>(column)).AddNull();
    }
    table.AddRecord();
}

// Ends the work when somebody has pressed Ctrl-C; asked a few times a second, since Python's lock
// may have to be waited for.
class CInterruption {
public:
    bool MayGoOn() {
        const auto now = std::chrono::steady_clock::now();
        if (now < mNext) return true;
        mNext = now + std::chrono::milliseconds(100);
        const nb::gil_scoped_acquire held;
        if (PyErr_CheckSignals() != 0) throw nb::python_error();
        return true;
    }

private:
    std::chrono::steady_clock::time_point mNext{};
};

// What a row holds until it is written, about.
std::size_t WeightOf(const std::optional<CSongRow>& row) {
    constexpr std::size_t kBytesOfChord = 512;
    return sizeof(CSongRow) + (row ? ChordCount(row->mSong) * kBytesOfChord : 0);
}

CArrowColumn TableOf(const CTexts& texts, std::size_t threadCount, const CSongOptions& options) {
    CArrowColumn table = SongsTable();
    std::size_t next = 0;
    CParallelSteps<std::size_t, std::optional<CSongRow>> steps;
    steps.mNext = [&] { return next < texts.size() ? std::optional(next++) : std::nullopt; };
    steps.mWork = [&](std::size_t i) {
        return texts[i] ? std::optional(RowOf(*texts[i], options)) : std::nullopt;
    };
    steps.mTake = [&](std::optional<CSongRow>&& row) {
        row ? AddSong(table, *row) : AddNoSong(table);
        return true;
    };
    // The texts are there anyhow.
    steps.mWeightOfPiece = [](std::size_t) { return std::size_t{1}; };
    steps.mWeightOfResult = WeightOf;
    CInterruption interruption;
    steps.mPulse = [&] { return interruption.MayGoOn(); };
    WorkInParallel(steps, {.mJobs = std::min(threadCount, kMostThreads)});
    return table;
}

template <class TRecord>
void ReleaseCapsule(PyObject* capsule, const char* name) {
    auto* const record = static_cast<TRecord*>(PyCapsule_GetPointer(capsule, name));
    if (record->release != nullptr) record->release(record);
    delete record;
}

nb::tuple CapsulesOf(CArrowColumn& table) {
    auto schema = std::make_unique<ArrowSchema>();
    auto array = std::make_unique<ArrowArray>();
    table.MoveTo(*schema, *array);
    const nb::object schemaCapsule =
        nb::steal(PyCapsule_New(schema.release(), "arrow_schema", [](PyObject* capsule) {
            ReleaseCapsule<ArrowSchema>(capsule, "arrow_schema");
        }));
    const nb::object arrayCapsule =
        nb::steal(PyCapsule_New(array.release(), "arrow_array", [](PyObject* capsule) {
            ReleaseCapsule<ArrowArray>(capsule, "arrow_array");
        }));
    return nb::make_tuple(schemaCapsule, arrayCapsule);
}

// The texts belong to the objects of the list.
CTexts TextsOfList(const nb::list& list) {
    CTexts texts;
    texts.reserve(list.size());
    for (const nb::handle element : list) {
        if (element.is_none()) {
            texts.push_back(std::nullopt);
        } else if (nb::isinstance<nb::bytes>(element)) {
            const auto bytes = nb::borrow<nb::bytes>(element);
            texts.push_back(std::string_view(bytes.c_str(), bytes.size()));
        } else if (!nb::isinstance<nb::str>(element)) {
            const std::string type = nb::inst_name(element).c_str();
            throw nb::type_error(("texts[" + std::to_string(texts.size()) + "] is of type " + type +
                                  ", not str, bytes or None")
                                     .c_str());
        } else {
            Py_ssize_t size = 0;
            const char* const text = PyUnicode_AsUTF8AndSize(element.ptr(), &size);
            if (text == nullptr) throw nb::python_error();
            texts.push_back(std::string_view(text, static_cast<std::size_t>(size)));
        }
    }
    return texts;
}

// Of an array of large binaries, which its user keeps.
CTexts TextsOfArrow(const ArrowArray& array) {
    CTexts texts;
    texts.reserve(static_cast<std::size_t>(array.length));
    const auto* const validity = static_cast<const std::uint8_t*>(array.buffers[0]);
    const auto* const offsets = static_cast<const std::int64_t*>(array.buffers[1]);
    const auto* const data = static_cast<const char*>(array.buffers[2]);
    for (std::int64_t i = array.offset; i < array.offset + array.length; ++i) {
        if (validity != nullptr && (validity[i / 8] >> (i % 8) & 1) == 0) {
            texts.push_back(std::nullopt);
        } else {
            const std::int64_t size = offsets[i + 1] - offsets[i];
            texts.push_back(
                size == 0 ? std::string_view()
                          : std::string_view(data + offsets[i], static_cast<std::size_t>(size)));
        }
    }
    return texts;
}

nb::tuple Analyse(const CTexts& texts, std::size_t threadCount, bool isLenient) {
    CSongOptions options;
    options.mLenient = isLenient;
    std::optional<CArrowColumn> table;
    {
        const nb::gil_scoped_release released;
        table = TableOf(texts, threadCount, options);
    }
    if (table->IsTooLong()) throw nb::value_error("too much for one batch: hand in fewer songs");
    return CapsulesOf(*table);
}

nb::tuple AnalyseList(const nb::list& list, std::size_t threadCount, bool isLenient) {
    return Analyse(TextsOfList(list), threadCount, isLenient);
}

nb::tuple AnalyseArrow(const nb::capsule& array, std::size_t threadCount, bool isLenient) {
    const auto* const content = static_cast<const ArrowArray*>(array.data("arrow_array"));
    return Analyse(TextsOfArrow(*content), threadCount, isLenient);
}

}  // namespace

void BindBatch(nb::module_& module) {
    const nb::sig signature(
        "def _analyse_list(texts: list[str | bytes | None], threads: int, lenient: bool) -> "
        "tuple[typing.Any, typing.Any]");
    module.def("_analyse_list", AnalyseList, nb::arg("texts"), nb::arg("threads"),
               nb::arg("lenient"), signature, "The capsules of a table, for a list of songs.");
    module.def("_analyse_arrow", AnalyseArrow, nb::arg("texts"), nb::arg("threads"),
               nb::arg("lenient"),
               nb::sig("def _analyse_arrow(texts: typing.Any, threads: int, lenient: bool) -> "
                       "tuple[typing.Any, typing.Any]"),
               "The same for the capsule of an array of large binaries.");
}

}  // namespace brindle::python
