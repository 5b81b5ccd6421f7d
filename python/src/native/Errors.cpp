// SPDX-License-Identifier: MIT
#include "Errors.h"

#include <new>
#include <typeinfo>

namespace brindle::python {
namespace {

void RaiseFault(const std::exception_ptr& thrown, void* /*payload*/) {
    try {
        std::rethrow_exception(thrown);
    } catch (const CFault& fault) {
        const nb::object kind = nb::module_::import_("brindle._errors").attr(fault.mKind.c_str());
        const auto textOf = [](const std::string& text) {
            return nb::steal(
                PyUnicode_DecodeUTF8(text.data(), static_cast<Py_ssize_t>(text.size()), "replace"));
        };
        const nb::tuple arguments =
            nb::make_tuple(textOf(fault.mMessage), textOf(fault.mText), fault.mPosition);
        PyErr_SetObject(kind.ptr(), arguments.ptr());
    } catch (const std::bad_cast&) {
        // Arguments of several types are cast by hand.
        PyErr_SetString(PyExc_TypeError, "an argument is of another type than this function takes");
    }
}

}  // namespace

void Check(brindle_status status, const char* kind) {
    if (status == BRINDLE_OK) return;
    if (status == BRINDLE_ERROR_MEMORY) throw std::bad_alloc();
    throw CFault(kind, brindle_last_error(), {}, brindle_last_error_position());
}

void BindErrors() {
    nb::register_exception_translator(RaiseFault);
}

}  // namespace brindle::python
