// Drives Property through thousands of random steps and checks it after each
// one against a small reference model of shared stores.
#include <gtest/gtest.h>

#include <climits>
#include <map>
#include <memory>
#include <optional>
#include <random>
#include <string>
#include <variant>
#include <vector>

#include "vantorbase/property.h"

namespace {

using Value = std::variant<int, void*, std::string, std::wstring>;
const char* const kTypeNames[] = {"int", "IntPtr", "string", "wstring"};

// The model of one store: every key ever written, with its value if any.
using ModelStore = std::map<std::string, std::optional<Value>>;

struct Sharer {
    std::unique_ptr<Property> property;
    std::shared_ptr<ModelStore> model;
};

class ModelRun {
public:
    explicit ModelRun(unsigned seed) : m_random(seed) { AddFresh(); }

    void Step() {
        switch (Pick(14)) {
            case 0: case 1: case 2: case 3: Write(); break;
            case 4: case 5: case 6: Read(); break;
            case 7: EraseKey(); break;
            case 8: EraseRange(); break;
            case 9:
                if (Pick(4) == 0) {
                    Target().property->Clear();
                    Clear(*Target().model);
                }
                break;
            case 10: Copy(); break;
            case 11: Assign(); break;
            case 12: Destroy(); break;
            default: Enumerate(); break;
        }
    }

    // The store of the current sharer matches its model, entry by entry.
    void Check() {
        for (auto& sharer : m_sharers) {
            Property& store = *sharer.property;
            const ModelStore& model = *sharer.model;
            ASSERT_EQ(store.getCount(), static_cast<int>(model.size()));
            int position = 0;
            for (const auto& [key, value] : model) {
                std::string got, type;
                ASSERT_TRUE(store.getKey(position, got));
                ASSERT_EQ(got, key);
                ASSERT_EQ(store.getType(position, type), value.has_value()) << key;
                if (value) {
                    ASSERT_EQ(type, kTypeNames[value->index()]) << key;
                }
                ++position;
            }
        }
    }

private:
    int Pick(int n) { return std::uniform_int_distribution<int>(0, n - 1)(m_random); }

    Sharer& Target() { return m_sharers[m_current]; }

    std::string Name() {
        static const char* const names[] = {"a", "b", "B", "ab", "Items", "It", "\xE9"};
        return names[Pick(7)];
    }
    int Index() {
        static const int special[] = {INT_MIN, -1, 0, 1, 2, 7, 10, INT_MAX};
        return Pick(3) == 0 ? special[Pick(8)] : Pick(12) - 2;
    }

    static void Clear(ModelStore& model) {
        for (auto& entry : model) entry.second.reset();
    }

    void AddFresh() {
        m_sharers.push_back({std::make_unique<Property>(), std::make_shared<ModelStore>()});
        m_current = m_sharers.size() - 1;
    }

    void Write() {
        Property& store = *Target().property;
        const bool element = Pick(2) == 0;
        const std::string name = Name();
        const int index = Index();
        const std::string key = element ? Property::GetArrayKey(name.c_str(), index) : name;
        Value value;
        const bool upper = Pick(2) == 0;
        switch (Pick(4)) {
            case 0: {
                const int v = Pick(1000);
                value = v;
                if (!upper) store.setValue(key, v);
                else if (element) store.SetValue(name, index, v);
                else store.SetValue(name.c_str(), v);
                break;
            }
            case 1: {
                void* v = reinterpret_cast<void*>(static_cast<uintptr_t>(Pick(1000) * 16));
                value = v;
                if (!upper) store.setValue(key, static_cast<int*>(v));
                else if (element) store.SetPointer(name.c_str(), index, v);
                else store.SetHandle(name, v);
                break;
            }
            case 2: {
                const std::string v(static_cast<size_t>(Pick(40)), static_cast<char>('a' + Pick(26)));
                value = v;
                if (!upper) store.setValue(key, v);
                else if (element) store.SetString(name, index, v.c_str());
                else store.SetString(name.c_str(), v.c_str());
                break;
            }
            default: {
                const std::wstring v(static_cast<size_t>(Pick(40)), static_cast<wchar_t>(L'a' + Pick(26)));
                value = v;
                if (!upper) store.setValue(key, v);
                else if (element) store.SetStringW(name.c_str(), index, v.c_str());
                else store.SetStringW(name, v.c_str());
                break;
            }
        }
        (*Target().model)[key] = value;
    }

    void Read() {
        Property& store = *Target().property;
        const std::string key = Pick(2) == 0 ? Name() : Property::GetArrayKey(Name().c_str(), Index());
        const auto it = Target().model->find(key);
        const std::optional<Value> expected =
            it == Target().model->end() ? std::nullopt : it->second;
        const int kind = Pick(4);
        const bool present = expected && static_cast<int>(expected->index()) == kind;
        switch (kind) {
            case 0: {
                int out = -1;
                ASSERT_EQ(store.getValue(key, out), present) << key;
                if (present) {
                    ASSERT_EQ(out, std::get<int>(*expected));
                } else {
                    ASSERT_EQ(out, -1);
                    ASSERT_THROW(store.GetValue(key), PropertyException);
                }
                break;
            }
            case 1:
                if (present) {
                    ASSERT_EQ(store.GetPointer(key), std::get<void*>(*expected));
                } else {
                    ASSERT_THROW(store.GetHandle(key.c_str()), PropertyException);
                }
                break;
            case 2:
                if (present) {
                    ASSERT_EQ(store.GetString(key), std::get<std::string>(*expected));
                } else {
                    ASSERT_THROW(store.GetString(key.c_str()), PropertyException);
                }
                break;
            default: {
                std::wstring out = L"kept";
                ASSERT_EQ(store.getValue(key, out), present);
                if (present) {
                    ASSERT_EQ(out, std::get<std::wstring>(*expected));
                } else {
                    ASSERT_EQ(out, L"kept");
                }
                break;
            }
        }
    }

    void EraseKey() {
        const std::string name = Name();
        if (Pick(2) == 0) {
            Target().property->Erase(name);
            EraseModel(name);
        } else {
            const int index = Index();
            Target().property->Erase(name, index);
            EraseModel(Property::GetArrayKey(name.c_str(), index));
        }
    }

    void EraseRange() {
        const std::string name = Name();
        int first = Index(), last = Index();
        if (Pick(6) == 0) first = INT_MIN, last = INT_MAX;
        Target().property->Erase(name, first, last);
        if (first > last) return;
        // The model erases index by index over the keys it holds.
        for (auto& [key, value] : *Target().model) {
            for (int candidate : {INT_MIN, -2, -1, 0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, INT_MAX})
                if (candidate >= first && candidate <= last &&
                    key == Property::GetArrayKey(name.c_str(), candidate))
                    value.reset();
        }
    }

    void EraseModel(const std::string& key) {
        const auto it = Target().model->find(key);
        if (it != Target().model->end()) it->second.reset();
    }

    void Copy() {
        if (m_sharers.size() > 6) return;
        Sharer copy{std::make_unique<Property>(*Target().property), Target().model};
        m_sharers.push_back(std::move(copy));
        m_current = static_cast<size_t>(Pick(static_cast<int>(m_sharers.size())));
    }

    void Assign() {
        const size_t source = static_cast<size_t>(Pick(static_cast<int>(m_sharers.size())));
        *Target().property = *m_sharers[source].property;
        Target().model = m_sharers[source].model;
    }

    void Destroy() {
        if (m_sharers.size() == 1) {
            Clear(*Target().model);
            Target().property.reset();
            m_sharers.clear();
            AddFresh();
            return;
        }
        Clear(*Target().model);
        m_sharers.erase(m_sharers.begin() + static_cast<std::ptrdiff_t>(m_current));
        m_current = static_cast<size_t>(Pick(static_cast<int>(m_sharers.size())));
    }

    void Enumerate() {
        m_current = static_cast<size_t>(Pick(static_cast<int>(m_sharers.size())));
        Property& store = *Target().property;
        // Random positional reads exercise the enumeration cursor.
        for (int i = 0; i < 5; ++i) {
            const int position = Pick(store.getCount() + 2) - 1;
            std::string key = "kept";
            const bool inside = position >= 0 && position < store.getCount();
            ASSERT_EQ(store.getKey(position, key), inside);
            if (inside) {
                ASSERT_EQ(key, std::next(Target().model->begin(), position)->first);
            } else {
                ASSERT_EQ(key, "kept");
            }
        }
        if (Pick(8) == 0) AddFresh();
    }

    std::mt19937 m_random;
    std::vector<Sharer> m_sharers;
    size_t m_current = 0;
};

}  // namespace

TEST(PropertyModel, RandomStepsMatchTheReferenceModel) {
    std::vector<unsigned> seeds = {1u, 2u, 20261206u, std::random_device{}()};
    for (unsigned seed : seeds) {
        SCOPED_TRACE("seed " + std::to_string(seed));
        ModelRun run(seed);
        for (int step = 0; step < 3000; ++step) {
            run.Step();
            ASSERT_FALSE(::testing::Test::HasFatalFailure()) << "step " << step;
            run.Check();
            ASSERT_FALSE(::testing::Test::HasFatalFailure()) << "step " << step;
        }
    }
}
