// SPDX-License-Identifier: MIT
#include "ArrowColumn.h"

#include <limits>
#include <memory>

namespace brindle::python {
namespace {

void SetBit(std::vector<std::uint8_t>& bits, std::int64_t index, bool isSet) {
    const auto byte = static_cast<std::size_t>(index / 8);
    if (byte >= bits.size()) bits.push_back(0);
    if (isSet) bits[byte] |= static_cast<std::uint8_t>(1U << (index % 8));
}

// Readers want a place even for nothing.
const void* PlaceOf(const void* data) {
    static const std::int64_t nothing = 0;
    return data != nullptr ? data : &nothing;
}

}  // namespace

// What the records of the interface point into, for as long as their user keeps them.
struct CArrowColumn::CExportedSchema {
    std::string mName;
    std::string mFormat;
    std::vector<ArrowSchema> mChildren;
    std::vector<ArrowSchema*> mPointers;

    static void Release(ArrowSchema* schema) {
        auto* const own = static_cast<CExportedSchema*>(schema->private_data);
        for (ArrowSchema& child : own->mChildren) {
            if (child.release != nullptr) child.release(&child);
        }
        delete own;
        schema->release = nullptr;
    }
};

struct CArrowColumn::CExportedArray {
    std::vector<std::uint8_t> mValidity;
    std::vector<std::int32_t> mOffsets;
    std::vector<std::uint8_t> mData;
    std::vector<const void*> mBuffers;
    std::vector<ArrowArray> mChildren;
    std::vector<ArrowArray*> mPointers;

    static void Release(ArrowArray* array) {
        auto* const own = static_cast<CExportedArray*>(array->private_data);
        for (ArrowArray& child : own->mChildren) {
            if (child.release != nullptr) child.release(&child);
        }
        delete own;
        array->release = nullptr;
    }
};

CArrowColumn::CArrowColumn(std::string name, std::string format, std::vector<CArrowColumn> children)
    : mName(std::move(name)), mFormat(std::move(format)), mChildren(std::move(children)) {
    if (HasOffsets()) mOffsets.push_back(0);
}

std::size_t CArrowColumn::WidthOfNumber() const {
    switch (mFormat[0]) {
        case 'g':
            return 8;
        case 'i':
            return 4;
        case 's':
            return 2;
        default:
            return 1;
    }
}

void CArrowColumn::AddValid(bool isValid) {
    SetBit(mValidity, mLength, isValid);
    if (!isValid) ++mNullCount;
    ++mLength;
}

void CArrowColumn::AddOffset(std::size_t end) {
    if (end > static_cast<std::size_t>(std::numeric_limits<std::int32_t>::max())) {
        mIsTooLong = true;
        end = static_cast<std::size_t>(mOffsets.back());
    }
    mOffsets.push_back(static_cast<std::int32_t>(end));
}

void CArrowColumn::AddNull() {
    if (HasOffsets()) {
        mOffsets.push_back(mOffsets.back());
    } else if (mFormat == "b") {
        SetBit(mData, mLength, false);
    } else if (mFormat != "+s") {
        mData.resize(mData.size() + WidthOfNumber());
    }
    AddValid(false);
}

void CArrowColumn::AddFlag(bool flag) {
    SetBit(mData, mLength, flag);
    AddValid(true);
}

void CArrowColumn::AddText(std::string_view text) {
    mData.insert(mData.end(), text.begin(), text.end());
    AddOffset(mData.size());
    AddValid(true);
}

void CArrowColumn::AddList() {
    AddOffset(static_cast<std::size_t>(mChildren.front().mLength));
    AddValid(true);
}

bool CArrowColumn::IsTooLong() const {
    for (const CArrowColumn& child : mChildren) {
        if (child.IsTooLong()) return true;
    }
    return mIsTooLong;
}

void CArrowColumn::MoveTo(ArrowSchema& schema, ArrowArray& array) {
    auto shape = std::make_unique<CExportedSchema>();
    auto content = std::make_unique<CExportedArray>();
    shape->mChildren.resize(mChildren.size());
    content->mChildren.resize(mChildren.size());
    for (std::size_t i = 0; i < mChildren.size(); ++i) {
        mChildren[i].MoveTo(shape->mChildren[i], content->mChildren[i]);
        shape->mPointers.push_back(&shape->mChildren[i]);
        content->mPointers.push_back(&content->mChildren[i]);
    }
    shape->mName = std::move(mName);
    shape->mFormat = mFormat;
    content->mValidity = std::move(mValidity);
    content->mOffsets = std::move(mOffsets);
    content->mData = std::move(mData);
    auto& buffers = content->mBuffers;
    buffers.push_back(mNullCount == 0 ? nullptr : content->mValidity.data());
    if (HasOffsets()) buffers.push_back(content->mOffsets.data());
    if (mFormat[0] != '+') buffers.push_back(PlaceOf(content->mData.data()));

    const auto count = static_cast<std::int64_t>(mChildren.size());
    schema = {shape->mFormat.c_str(),
              shape->mName.c_str(),
              nullptr,
              ARROW_FLAG_NULLABLE,
              count,
              shape->mPointers.data(),
              nullptr,
              CExportedSchema::Release,
              shape.get()};
    array = {mLength,
             mNullCount,
             0,
             static_cast<std::int64_t>(buffers.size()),
             count,
             buffers.data(),
             content->mPointers.data(),
             nullptr,
             CExportedArray::Release,
             content.get()};
    shape.release();
    content.release();
    mLength = mNullCount = 0;
}

}  // namespace brindle::python
