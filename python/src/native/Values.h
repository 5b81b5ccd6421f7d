// SPDX-License-Identifier: MIT
#pragma once

#include <nanobind/nanobind.h>
#include <nanobind/operators.h>

#include <cstddef>
#include <functional>
#include <string>

namespace brindle::python {

namespace nb = nanobind;

/// Gives a class of unchanging values what Python expects of one: order, hash, copies and pickles.
/// `stateOf` gives a tuple of numbers, of which `valueOf` makes the value again.
template <class T, class TStateOf, class TValueOf>
void BindValue(nb::class_<T>& type, TStateOf stateOf, TValueOf valueOf) {
    type.def(nb::self == nb::self, nb::sig("def __eq__(self, other: object, /) -> bool"));
    type.def(nb::self < nb::self, nb::is_operator());
    type.def(
        "__gt__", [](const T& a, const T& b) { return b < a; }, nb::is_operator());
    type.def(
        "__le__", [](const T& a, const T& b) { return !(b < a); }, nb::is_operator());
    type.def(
        "__ge__", [](const T& a, const T& b) { return !(a < b); }, nb::is_operator());
    type.def("__hash__", [stateOf](const T& value) { return nb::hash(stateOf(value)); });
    type.def("__copy__", [](const T& value) { return value; });
    type.def("__deepcopy__", [](const T& value, const nb::handle&) { return value; });
    type.def("__getstate__", stateOf);
    type.def("__setstate__",
             [valueOf](T& value, const nb::tuple& state) { new (&value) T(valueOf(state)); });
}

}  // namespace brindle::python
