#pragma once

#include "platform/KeyedList.h"

#include <memory>
#include <string>
#include <utility>

namespace tovimar {

/// Adds under `key`, and while that is taken under the key with one more "_". Raises 457 after a thousand
/// attempts: more things of one name are no application's, and the keys grow with each.
template <typename T>
void AddWithFreeKey(KeyedList<std::unique_ptr<T>>& list, std::unique_ptr<T> item, std::string key) {
    for (int attempts = 0; attempts < 1000 && list.Contains(key); ++attempts)
        key += "_";
    list.Add(std::move(item), key);
}

} // namespace tovimar
