/// A bounded store that forgets what was not asked for longest.
#pragma once

#include <cstddef>
#include <list>
#include <string>
#include <unordered_map>
#include <utility>

namespace MoxFontService_NS {

/// Keeps values by key, up to a count and up to a sum of costs; the newest value always stays.
/// Not safe for threads by itself.
template <typename Value> class FS_LruCache {
public:
    FS_LruCache(std::size_t maxCount, std::size_t maxCost)
        : mostValues(maxCount), mostCost(maxCost) {}

    /// Returns: the value kept under `key`, which becomes the newest; null when there is none.
    /// Borrows: the cache keeps it, until the next change.
    Value* find(const std::string& key) {
        const auto place = places.find(key);
        if (place == places.end()) {
            return nullptr;
        }
        items.splice(items.begin(), items, place->second);
        return &items.front().value;
    }

    /// Keeps `value` under `key`, which has none yet, and forgets old values beyond the bounds.
    void insert(const std::string& key, Value value, std::size_t cost) {
        std::list<Item> made;
        made.push_front({key, std::move(value), cost});
        places.emplace(key, made.begin());
        items.splice(items.begin(), made);
        sumOfCosts += cost;
        while (items.size() > 1 && (items.size() > mostValues || sumOfCosts > mostCost)) {
            forgetOldest();
        }
    }

    void clear() {
        places.clear();
        items.clear();
        sumOfCosts = 0;
    }

    std::size_t size() const { return items.size(); }

private:
    struct Item {
        std::string key;
        Value value;
        std::size_t cost;
    };

    void forgetOldest() {
        sumOfCosts -= items.back().cost;
        places.erase(items.back().key);
        items.pop_back();
    }

    std::size_t mostValues;
    std::size_t mostCost;
    std::size_t sumOfCosts = 0;
    std::list<Item> items; // the newest first
    std::unordered_map<std::string, typename std::list<Item>::iterator> places;
};

} // namespace MoxFontService_NS
