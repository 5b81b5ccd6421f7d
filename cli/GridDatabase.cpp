// SPDX-License-Identifier: MIT
#include "cli/GridDatabase.h"

#include "cli/Input.h"

#include "brindle/platform/FileTree.h"
#include "brindle/platform/Resources.h"

#include <fmt/format.h>

namespace brindle::cli {

std::unique_ptr<GChDatabase> ReadGrids(const std::string& packagePath) {
    auto database = std::make_unique<GChDatabase>();
    const std::string path =
        packagePath.empty() ? (ResourceFolder() / kGChFactoryPackagePath).string() : packagePath;
    if (!GChIsDbPackageAtPath(path) || !database->readFromDbPackageAtPath(path)) {
        Fail(TStatus::BadInput, fmt::format("{} is no package of chord grids", Printable(path)));
        return nullptr;
    }
    if (packagePath.empty()) database->readFromDbPackageAtPath(kGChUserPackagePath);
    return database;
}

}  // namespace brindle::cli
