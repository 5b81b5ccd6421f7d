// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <boost/container/flat_set.hpp>
#include <boost/container/small_vector.hpp>
#include <functional>
#include <initializer_list>
#include <iterator>
#include <ostream>
#include <type_traits>
#include <utility>

namespace brindle {

/// An ordered set with unique members, such as the key numbers of a chord or its notes.
///
/// It has the interface of `std::set` and keeps its members in one sorted array; up to twelve of
/// them, one per key, need no allocation. Inserting or erasing makes iterators invalid.
template <class T>
class CMySet
    : public boost::container::flat_set<T, std::less<T>, boost::container::small_vector<T, 12>> {
    using TMembers = boost::container::small_vector<T, 12>;
    using Base = boost::container::flat_set<T, std::less<T>, TMembers>;

public:
    CMySet() = default;
    /// Of members as they are written down.
    CMySet(std::initializer_list<T> members) : CMySet(members.begin(), members.end()) {}
    /// Of members in any order; what occurs twice is in it once.
    template <std::input_iterator Iterator>
    CMySet(Iterator first, Iterator last) {
        // The set's own merge of ranges is compiled five times as long as this.
        TMembers members(first, last);
        std::sort(members.begin(), members.end());
        members.erase(std::unique(members.begin(), members.end()), members.end());
        this->adopt_sequence(boost::container::ordered_unique_range, std::move(members));
    }

    /// The members of both sets.
    [[nodiscard]] friend CMySet operator+(const CMySet& a, const CMySet& b) {
        CMySet both;
        both.reserve(a.size() + b.size());
        std::set_union(a.begin(), a.end(), b.begin(), b.end(), std::inserter(both, both.end()));
        return both;
    }
    /// The members of `a` that are not in `b`.
    [[nodiscard]] friend CMySet operator-(const CMySet& a, const CMySet& b) {
        CMySet rest;
        std::set_difference(a.begin(), a.end(), b.begin(), b.end(),
                            std::inserter(rest, rest.end()));
        return rest;
    }
    /// The members that are in both sets.
    [[nodiscard]] friend CMySet operator&(const CMySet& a, const CMySet& b) {
        CMySet common;
        std::set_intersection(a.begin(), a.end(), b.begin(), b.end(),
                              std::inserter(common, common.end()));
        return common;
    }
    /// Whether every member of `other` is in this set.
    [[nodiscard]] bool Includes(const CMySet& other) const {
        return std::includes(this->begin(), this->end(), other.begin(), other.end());
    }
};

/// Writes the members as `{0, 4, 7}`; bytes are numbers too.
template <class T>
std::ostream& operator<<(std::ostream& stream, const CMySet<T>& set) {
    stream << '{';
    const char* separator = "";
    for (const T& member : set) {
        stream << separator;
        if constexpr (std::is_integral_v<T>) {
            stream << +member;
        } else {
            stream << member;
        }
        separator = ", ";
    }
    return stream << '}';
}

}  // namespace brindle
