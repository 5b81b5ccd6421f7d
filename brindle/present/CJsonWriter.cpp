// SPDX-License-Identifier: MIT
// A level stays pending, in one line without blanks, until it is closed or too long for a line.
// Then it is broken: its parts so far are written line by line, and the last of them, if it is an
// open level itself, is what is pending now. A part that was closed in time needs no second look,
// since a whole that fits has parts that fit.

#include "brindle/present/CJsonWriter.h"

#include "brindle/analysis/Positions.h"
#include "brindle/platform/JsonString.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <iterator>
#include <nlohmann/json.hpp>
#include <utility>

namespace brindle {
namespace {

constexpr std::size_t kWidestJsonLine = 120;
constexpr std::size_t kIndent = 2;
// Whole numbers beyond have an exponent.
constexpr double kLargestPlainNumber = 1e15;

}  // namespace

CJsonWriter& CJsonWriter::Key(std::string_view name) {
    BeginPart();
    Append(JsonString(name));
    Append(IsPending() ? ":" : ": ");
    if (IsPending()) mParts.back().mKeyEnd = mPending.size();
    mIsBehindKey = true;
    return *this;
}

CJsonWriter& CJsonWriter::Integer(std::int64_t value) {
    return Scalar(fmt::format_int(value).c_str());
}

CJsonWriter& CJsonWriter::Count(std::uint64_t value) {
    return Scalar(fmt::format("{}", value));
}

CJsonWriter& CJsonWriter::Number(double value) {
    if (value == kPosUndef || !std::isfinite(value)) return Null();
    const bool isWhole = std::abs(value) < kLargestPlainNumber && std::floor(value) == value;
    if (isWhole && !std::signbit(value))
        return Scalar(fmt::format("{}.0", static_cast<std::int64_t>(value)));
    return Scalar(DumpJson(nlohmann::json(value)));
}

CJsonWriter& CJsonWriter::String(std::string_view text) {
    return Scalar(JsonString(text));
}

std::string CJsonWriter::Text() && {
    mText += '\n';
    return std::move(mText);
}

CJsonWriter& CJsonWriter::Begin(char opening) {
    BeginPart();
    mLevels.push_back({opening});
    Append({&opening, 1});
    BreakWhatIsTooLong();
    return *this;
}

CJsonWriter& CJsonWriter::End(char closing) {
    if (IsPending()) {
        mPending += closing;
        mLevels.pop_back();
        while (!mParts.empty() && mParts.back().mLevel >= mLevels.size()) mParts.pop_back();
        if (!IsPending()) {
            mText += mPending;
            mPending.clear();
        }
        return *this;
    }
    mLevels.pop_back();
    mBrokenLevels = mLevels.size();
    AppendMargin(mLevels.size());
    mText += closing;
    return *this;
}

CJsonWriter& CJsonWriter::Scalar(std::string_view text) {
    BeginPart();
    Append(text);
    BreakWhatIsTooLong();
    return *this;
}

// What separates a part from the one before it. The value behind a key is no part of its own.
void CJsonWriter::BeginPart() {
    if (std::exchange(mIsBehindKey, false) || mLevels.empty()) return;
    const bool isFirst = mLevels.back().mCount++ == 0;
    if (!isFirst) Append(",");
    if (IsPending()) {
        mParts.push_back({mLevels.size() - 1, mPending.size(), mPending.size()});
    } else {
        AppendMargin(mLevels.size());
    }
}

void CJsonWriter::Append(std::string_view text) {
    (IsPending() ? mPending : mText) += text;
}

void CJsonWriter::BreakWhatIsTooLong() {
    while (IsPending() && mLevels[mBrokenLevels].mCount > 0) {
        const std::size_t closings = mLevels.size() - mBrokenLevels;
        if (kIndent * mBrokenLevels + mPending.size() + closings <= kWidestJsonLine) return;
        BreakOutermost();
    }
}

void CJsonWriter::BreakOutermost() {
    const std::size_t level = mBrokenLevels++;
    mText += mPending.front();
    const auto isOfLevel = [&](const CPart& part) { return part.mLevel == level; };
    const auto behind = std::find_if_not(mParts.begin(), mParts.end(), isOfLevel);
    std::size_t done = 0;
    for (auto part = mParts.begin(); part != behind; ++part) {
        const auto next = std::next(part);
        // Behind every part but the last there is a comma.
        const std::size_t end = next == behind ? mPending.size() : next->mBegin - 1;
        if (part != mParts.begin()) mText += ',';
        AppendMargin(level + 1);
        mText.append(mPending, part->mBegin, part->mKeyEnd - part->mBegin);
        if (part->mKeyEnd > part->mBegin) mText += ' ';
        done = part->mKeyEnd;
        if (next == behind && IsPending()) break;
        mText.append(mPending, part->mKeyEnd, end - part->mKeyEnd);
        done = end;
    }
    mPending.erase(0, done);
    mParts.erase(mParts.begin(), behind);
    for (CPart& part : mParts) {
        part.mBegin -= done;
        part.mKeyEnd -= done;
    }
}

void CJsonWriter::AppendMargin(std::size_t level) {
    mText += '\n';
    mText.append(kIndent * level, ' ');
}

std::string JsonOnOneLine(std::string_view json) {
    std::string line;
    line.reserve(json.size());
    bool isInString = false;
    bool isEscaped = false;
    for (const char c : json) {
        if (isInString || (c != ' ' && c != '\n')) line += c;
        if (c == '"' && !isEscaped) isInString = !isInString;
        isEscaped = isInString && c == '\\' && !isEscaped;
    }
    line += '\n';
    return line;
}

}  // namespace brindle
