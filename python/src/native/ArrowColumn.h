// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

// The two records of Arrow's C data interface, by which engines hand tables to each other. Their
// layout never changes; the guard is the one that all its users share.
#ifndef ARROW_C_DATA_INTERFACE
#define ARROW_C_DATA_INTERFACE

#define ARROW_FLAG_DICTIONARY_ORDERED 1
#define ARROW_FLAG_NULLABLE 2
#define ARROW_FLAG_MAP_KEYS_SORTED 4

extern "C" {
struct ArrowSchema {
    const char* format;
    const char* name;
    const char* metadata;
    int64_t flags;
    int64_t n_children;
    struct ArrowSchema** children;
    struct ArrowSchema* dictionary;
    void (*release)(struct ArrowSchema*);
    void* private_data;
};

struct ArrowArray {
    int64_t length;
    int64_t null_count;
    int64_t offset;
    int64_t n_buffers;
    int64_t n_children;
    const void** buffers;
    struct ArrowArray** children;
    struct ArrowArray* dictionary;
    void (*release)(struct ArrowArray*);
    void* private_data;
};
}

#endif  // ARROW_C_DATA_INTERFACE

namespace brindle::python {

/// A column of a table in Arrow's layout, filled from the first row to the last.
class CArrowColumn {
public:
    /// `format` is Arrow's: "g" doubles, "i" 32 bits, "s" 16 bits, "c" 8 bits, "b" booleans, "u"
    /// UTF-8, "+l" lists, "+s" records.
    CArrowColumn(std::string name, std::string format, std::vector<CArrowColumn> children = {});

    void AddNull();
    /// Of the plain number that the format names.
    template <class TNumber>
    void AddNumber(TNumber number) {
        const auto* const bytes = reinterpret_cast<const std::uint8_t*>(&number);
        mData.insert(mData.end(), bytes, bytes + sizeof number);
        AddValid(true);
    }
    void AddFlag(bool flag);
    void AddText(std::string_view text);
    /// Ends a list whose elements are in the child, or a record whose fields are in the children.
    void AddList();
    void AddRecord() { AddValid(true); }

    [[nodiscard]] CArrowColumn& Child(std::size_t index) { return mChildren[index]; }
    /// Longer texts or lists than an offset of 32 bits can tell.
    [[nodiscard]] bool IsTooLong() const;

    /// The description and the content in new records, which belong to who releases them; the
    /// column is empty afterwards.
    void MoveTo(ArrowSchema& schema, ArrowArray& array);

private:
    void AddValid(bool isValid);
    void AddOffset(std::size_t end);
    [[nodiscard]] std::size_t WidthOfNumber() const;
    [[nodiscard]] bool HasOffsets() const { return mFormat == "u" || mFormat == "+l"; }

    std::string mName;
    std::string mFormat;
    std::vector<CArrowColumn> mChildren;
    std::int64_t mLength = 0;
    std::int64_t mNullCount = 0;
    std::vector<std::uint8_t> mValidity;
    std::vector<std::int32_t> mOffsets;
    std::vector<std::uint8_t> mData;
    bool mIsTooLong = false;

    struct CExportedSchema;
    struct CExportedArray;
};

}  // namespace brindle::python
