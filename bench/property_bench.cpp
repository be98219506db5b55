// Property store: enumeration, typed writes and reads, element keys, erasure.
#include <climits>
#include <iterator>
#include <map>
#include <string>
#include <variant>
#include <vector>

#include "harness.h"
#include "vantorbase/property.h"

namespace {

std::vector<std::string> MakeKeys(int n) {
    std::vector<std::string> keys;
    keys.reserve(static_cast<size_t>(n));
    for (int i = 0; i < n; ++i) keys.push_back("key" + std::to_string(i * 7919 % n));
    return keys;
}

// Time per step of a full enumeration by position.
double EnumerationStepNs(int n) {
    Property store;
    for (const auto& key : MakeKeys(n)) store.SetValue(key, 1);
    std::string key, type;
    const double pass = bench::Measure([&](std::int64_t iterations) {
        for (std::int64_t it = 0; it < iterations; ++it) {
            const int count = store.getCount();
            for (int i = 0; i < count; ++i) {
                store.getKey(i, key);
                store.getType(i, type);
            }
            bench::Keep(key);
        }
    });
    return pass / n;
}

}  // namespace

VANTORBASE_BENCH_GROUP(property_enumeration) {
    const int n = 10000;
    // Baseline: what a walk from the first entry on every call costs.
    std::map<std::string, int> map;
    for (const auto& key : MakeKeys(n)) map[key] = 1;
    std::string key;
    const double walk = bench::Measure([&](std::int64_t iterations) {
        for (std::int64_t it = 0; it < iterations; ++it) {
            for (int i = 0; i < n; ++i) {
                key = std::next(map.begin(), i)->first;
                bench::Keep(key);
            }
        }
    }) / n;
    bench::ReportBaseline("walk from first entry per step, n=10000", walk);
    const double step10k = EnumerationStepNs(n);
    bench::Report("getKey+getType per step, n=10000", step10k, "of the walk", walk);
    const double step1k = EnumerationStepNs(1000);
    bench::ReportBaseline("getKey+getType per step, n=1000", step1k);
    bench::Report("getKey+getType per step, n=100000", EnumerationStepNs(100000), "of n=1000",
                  step1k);
}

VANTORBASE_BENCH_GROUP(property_values) {
    using Variant = std::variant<int, void*, std::string, std::wstring>;
    const std::vector<std::string> keys = MakeKeys(64);
    std::map<std::string, Variant> map;
    Property store;
    for (const auto& key : keys) {
        map[key] = 0;
        store.SetValue(key, 0);
    }
    const double mapInt = bench::Measure([&](std::int64_t iterations) {
        int sum = 0;
        for (std::int64_t it = 0; it < iterations; ++it) {
            const std::string& key = keys[static_cast<size_t>(it & 63)];
            map[key] = static_cast<int>(it);
            sum += std::get<int>(map.find(key)->second);
        }
        bench::Keep(sum);
    });
    bench::ReportBaseline("std::map<string,variant> assign+lookup int", mapInt);
    const double propInt = bench::Measure([&](std::int64_t iterations) {
        int sum = 0;
        for (std::int64_t it = 0; it < iterations; ++it) {
            const std::string& key = keys[static_cast<size_t>(it & 63)];
            store.SetValue(key, static_cast<int>(it));
            sum += store.GetValue(key);
        }
        bench::Keep(sum);
    });
    bench::Report("SetValue+GetValue int", propInt, "of the map", mapInt);

    const std::string text = "a text of some thirty characters";
    for (const auto& key : keys) {
        map[key] = text;
        store.SetString(key, text.c_str());
    }
    const double mapText = bench::Measure([&](std::int64_t iterations) {
        size_t sum = 0;
        for (std::int64_t it = 0; it < iterations; ++it) {
            const std::string& key = keys[static_cast<size_t>(it & 63)];
            map[key] = text;
            std::string out = std::get<std::string>(map.find(key)->second);
            sum += out.size();
        }
        bench::Keep(sum);
    });
    bench::ReportBaseline("std::map<string,variant> assign+lookup string", mapText);
    const double propText = bench::Measure([&](std::int64_t iterations) {
        size_t sum = 0;
        for (std::int64_t it = 0; it < iterations; ++it) {
            const std::string& key = keys[static_cast<size_t>(it & 63)];
            store.SetString(key, text.c_str());
            sum += store.GetString(key).size();
        }
        bench::Keep(sum);
    });
    bench::Report("SetString+GetString", propText, "of the map", mapText);
}

VANTORBASE_BENCH_GROUP(property_elements) {
    Property store;
    std::vector<std::string> fullKeys;
    for (int i = 0; i < 1000; ++i) {
        store.SetValue("Items", i, i);
        fullKeys.push_back(Property::GetArrayKey("Items", i));
    }
    const double byKey = bench::Measure([&](std::int64_t iterations) {
        int sum = 0;
        for (std::int64_t it = 0; it < iterations; ++it)
            sum += store.GetValue(fullKeys[static_cast<size_t>(it % 1000)]);
        bench::Keep(sum);
    });
    bench::ReportBaseline("GetValue(\"Items[i]\") by full key", byKey);
    const double byIndex = bench::Measure([&](std::int64_t iterations) {
        int sum = 0;
        for (std::int64_t it = 0; it < iterations; ++it)
            sum += store.GetValue("Items", static_cast<int>(it % 1000));
        bench::Keep(sum);
    });
    bench::Report("GetValue(\"Items\", i) indexed", byIndex, "of the full key", byKey);

    // After the first round both walk the same, already empty, slots: the
    // figures compare the cost of finding the entries.
    const double clear = bench::Measure([&](std::int64_t iterations) {
        for (std::int64_t it = 0; it < iterations; ++it) store.Clear();
    });
    bench::ReportBaseline("Clear() on 1000 elements", clear);
    const double erase = bench::Measure([&](std::int64_t iterations) {
        for (std::int64_t it = 0; it < iterations; ++it) store.Erase("Items", INT_MIN, INT_MAX);
    });
    bench::Report("Erase(\"Items\", INT_MIN, INT_MAX) on 1000 elements", erase, "of Clear()", clear);
    const double refillClear = bench::Measure([&](std::int64_t iterations) {
        for (std::int64_t it = 0; it < iterations; ++it) {
            for (int i = 0; i < 1000; ++i) store.SetValue("Items", i, i);
            store.Clear();
        }
    });
    bench::ReportBaseline("refill 1000 elements + Clear()", refillClear);
    const double refillErase = bench::Measure([&](std::int64_t iterations) {
        for (std::int64_t it = 0; it < iterations; ++it) {
            for (int i = 0; i < 1000; ++i) store.SetValue("Items", i, i);
            store.Erase("Items", INT_MIN, INT_MAX);
        }
    });
    bench::Report("refill 1000 elements + Erase(INT_MIN, INT_MAX)", refillErase, "of refill+Clear",
                  refillClear);
}
