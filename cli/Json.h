// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/JsonValues.h"

#include <nlohmann/json.hpp>
