// Commands: typed parameter access against the store it rests on, and the
// description text.
#include <string>
#include <vector>

#include "harness.h"
#include "vantorbase/command.h"

namespace {

class SixteenParams : public Command {
public:
    SixteenParams() {
        for (int i = 0; i < 16; ++i) {
            AddParam(L"parameter" + std::to_wstring(i), 0, L"an int");
            AddParam(L"text" + std::to_wstring(i), 1, L"a text");
        }
    }
};

double DescribeNs(int entries) {
    CommandDesc desc;
    desc.SetDesc(L"Bench", L"a descriptor");
    for (int i = 0; i < entries / 2; ++i) {
        desc.AddParam(L"parameter" + std::to_wstring(i), i % 5, L"what it is for");
        desc.AddResult(L"result" + std::to_wstring(i), i % 5, L"what it gives");
    }
    return bench::Measure([&](std::int64_t iterations) {
        for (std::int64_t it = 0; it < iterations; ++it) {
            std::wstring text = desc.GetDescW();
            bench::Keep(text);
        }
    });
}

}  // namespace

VANTORBASE_BENCH_GROUP(command_params) {
    SixteenParams command;
    Property store;
    std::vector<std::string> intKeys, textKeys;
    for (int i = 0; i < 16; ++i) {
        intKeys.push_back("parameter" + std::to_string(i));
        textKeys.push_back("text" + std::to_string(i));
    }
    const double storeInt = bench::Measure([&](std::int64_t iterations) {
        int sum = 0;
        for (std::int64_t it = 0; it < iterations; ++it) {
            const std::string& key = intKeys[static_cast<size_t>(it & 15)];
            store.SetValue(key, static_cast<int>(it));
            sum += store.GetValue(key);
        }
        bench::Keep(sum);
    });
    bench::ReportBaseline("Property::SetValue+GetValue, 16 keys", storeInt);
    const double paramInt = bench::Measure([&](std::int64_t iterations) {
        int sum = 0, value = 0;
        for (std::int64_t it = 0; it < iterations; ++it) {
            const int index = static_cast<int>(it & 15) * 2;
            command.SetParam(index, static_cast<int>(it));
            command.GetParam(index, value);
            sum += value;
        }
        bench::Keep(sum);
    });
    bench::Report("SetParam+GetParam int, 16 parameters", paramInt, "of the store", storeInt);

    const std::string text = "a text of some thirty characters";
    const double storeText = bench::Measure([&](std::int64_t iterations) {
        size_t sum = 0;
        for (std::int64_t it = 0; it < iterations; ++it) {
            const std::string& key = textKeys[static_cast<size_t>(it & 15)];
            store.SetString(key, text.c_str());
            sum += store.GetString(key).size();
        }
        bench::Keep(sum);
    });
    bench::ReportBaseline("Property::SetString+GetString, 16 keys", storeText);
    const double paramText = bench::Measure([&](std::int64_t iterations) {
        size_t sum = 0;
        std::string value;
        for (std::int64_t it = 0; it < iterations; ++it) {
            const int index = static_cast<int>(it & 15) * 2 + 1;
            command.SetParam(index, text);
            command.GetParam(index, value);
            sum += value.size();
        }
        bench::Keep(sum);
    });
    bench::Report("SetParam+GetParam string, 16 parameters", paramText, "of the store", storeText);
}

VANTORBASE_BENCH_GROUP(command_description) {
    const double ten = DescribeNs(10);
    bench::ReportBaseline("GetDescW, 10 entries", ten);
    bench::Report("GetDescW, 100 entries", DescribeNs(100), "of 10 entries", ten);
}
