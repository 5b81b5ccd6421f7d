// SPDX-License-Identifier: MIT
#include "brindle/platform/PropertyList.h"

#include <plist/plist.h>
#include <nlohmann/json.hpp>

#include <cstdint>
#include <memory>

namespace brindle {

namespace {

struct CListCloser {
    void operator()(void* list) const { plist_free(list); }
};

struct CTextCloser {
    void operator()(char* text) const { plist_to_xml_free(text); }
};

plist_t ListOf(const nlohmann::json& value) {
    using nlohmann::json;
    switch (value.type()) {
        case json::value_t::object: {
            plist_t dictionary = plist_new_dict();
            for (const auto& [key, member] : value.items()) {
                plist_dict_set_item(dictionary, key.c_str(), ListOf(member));
            }
            return dictionary;
        }
        case json::value_t::array: {
            plist_t array = plist_new_array();
            for (const json& member : value) plist_array_append_item(array, ListOf(member));
            return array;
        }
        case json::value_t::boolean:
            return plist_new_bool(value.get<bool>() ? 1 : 0);
        case json::value_t::number_integer:
        case json::value_t::number_unsigned:
            return plist_new_uint(value.get<std::uint64_t>());
        case json::value_t::number_float:
            return plist_new_real(value.get<double>());
        case json::value_t::string:
            return plist_new_string(value.get_ref<const std::string&>().c_str());
        case json::value_t::null:
        case json::value_t::binary:
        case json::value_t::discarded:
            break;
    }
    return plist_new_string("");
}

}  // namespace

std::string PropertyListXml(const nlohmann::json& value) {
    const std::unique_ptr<void, CListCloser> list(ListOf(value));
    char* bytes = nullptr;
    std::uint32_t size = 0;
    plist_to_xml(list.get(), &bytes, &size);
    const std::unique_ptr<char, CTextCloser> closer(bytes);
    return bytes == nullptr ? std::string() : std::string(bytes, size);
}

}  // namespace brindle
