// SPDX-License-Identifier: MIT
#include "brindle/present/CTable.h"

#include <doctest/doctest.h>

namespace brindle::test {
namespace {

TEST_CASE("A table has all its columns, whatever the cells of a row") {
    CTable table({"a", " nr", ""});
    table.AddRow({"x"});
    table.AddRow({"F\u266F\u266F m", "7", "z", "lost"});
    CHECK(table.Text(CPaint(false)) ==
          "a      nr\n"
          "x\n"
          "F\u266F\u266F m   7  z\n");
}

}  // namespace
}  // namespace brindle::test
