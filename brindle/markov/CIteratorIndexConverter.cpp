// SPDX-License-Identifier: MIT
#include "brindle/markov/CIteratorIndexConverter.h"

#include <algorithm>

namespace brindle {

int CIteratorIndexConverter::InsertIfUniqueAndReturnIndex(MarkovIterator symbol) {
    const std::size_t orderClass = symbol->mOrderClass;
    if (orderClass >= mIndices.size()) {
        mIndices.resize(std::max(mObjects.size(), orderClass + 1), -1);
    }
    int& index = mIndices[orderClass];
    if (index < 0) index = static_cast<int>(symbol->mPlace);
    return index;
}

}  // namespace brindle
