// SPDX-License-Identifier: MIT
#include "brindle/markov/internal/ParseMarkovFile.h"

#include <nlohmann/json.hpp>

#include <utility>
#include <vector>

namespace brindle {
namespace {

using nlohmann::json;

/// Builds the file from the events of the parser. The parser's own builder with a filter looks
/// through all elements of a list behind each object in it, which takes n squared steps.
class CFileBuilder : public nlohmann::json_sax<json> {
public:
    explicit CFileBuilder(CMarkovFileTransitions& transitions) : mTransitions(transitions) {}

    [[nodiscard]] json Take() { return std::move(mFile); }

    bool null() override { return Put(nullptr) != nullptr; }
    bool boolean(bool value) override { return Put(value) != nullptr; }
    bool number_integer(number_integer_t value) override { return Put(value) != nullptr; }
    bool number_unsigned(number_unsigned_t value) override { return Put(value) != nullptr; }
    bool number_float(number_float_t value, const string_t&) override {
        return Put(value) != nullptr;
    }
    bool string(string_t& value) override { return Put(std::move(value)) != nullptr; }
    bool binary(binary_t&) override { return false; }
    bool start_object(std::size_t) override { return Open(json::object()); }
    bool start_array(std::size_t) override { return Open(json::array()); }
    bool end_object() override {
        mOpen.pop_back();
        return true;
    }
    bool end_array() override {
        mOpen.pop_back();
        if (mIsInTransitions && mOpen.size() == 3 && mOpen.back()->is_array()) {
            auto& entries = mOpen.back()->get_ref<json::array_t&>();
            mTransitions.Add(entries.back());
            entries.pop_back();
        }
        return true;
    }
    bool key(string_t& name) override {
        OnKey(name);
        mMember = &(*mOpen.back())[name];
        return true;
    }
    bool parse_error(std::size_t, const std::string&, const json::exception&) override {
        return false;
    }

private:
    void OnKey(const std::string& name) {
        const std::size_t depth = mOpen.size();
        if (depth == 1) mIsInModel = name == kMarkovModelKey;
        if (depth > 2) return;
        mIsInTransitions = depth == 2 && mIsInModel && name == kMarkovTransitionsKey;
        // Of several members of one name the last one counts.
        if (mIsInTransitions || (depth == 1 && mIsInModel)) mTransitions.Clear();
    }

    json* Put(json value) {
        if (mOpen.empty()) {
            mFile = std::move(value);
            return &mFile;
        }
        if (mOpen.back()->is_object()) {
            *mMember = std::move(value);
            return mMember;
        }
        auto& list = mOpen.back()->get_ref<json::array_t&>();
        list.push_back(std::move(value));
        return &list.back();
    }
    bool Open(json value) {
        mOpen.push_back(Put(std::move(value)));
        return true;
    }

    CMarkovFileTransitions& mTransitions;
    json mFile;
    /// The lists and objects that have not ended, the outermost first.
    std::vector<json*> mOpen;
    json* mMember = nullptr;
    bool mIsInModel = false;
    bool mIsInTransitions = false;
};

}  // namespace

json ParseMarkovFile(const std::string& text, CMarkovFileTransitions& transitions) {
    CFileBuilder builder(transitions);
    return json::sax_parse(text, &builder) ? builder.Take() : json();
}

}  // namespace brindle
