// Load: eight threads, each working on its own stores and commands, and four
// threads contending for one named mutex. Every loop is bounded in count and
// in time.
#include <gtest/gtest.h>

#include <chrono>
#include <map>
#include <memory>
#include <random>
#include <string>
#include <vector>

#include "vantorbase/vantorbase.h"

namespace {

using Clock = std::chrono::steady_clock;
constexpr auto kTimeLimit = std::chrono::seconds(60);

class Counter : public Observer {
public:
    void Update(Subject*) override { ++calls; }
    long calls = 0;
};

class Tally : public Command {
public:
    Tally() {
        SetDesc(L"counts");
        AddParam(L"step", 0, L"");
        AddParam(L"label", 1, L"");
        AddResult(L"total", 0, L"");
        AddResult(L"items", 2, L"");
    }
    void Run() override {
        int step = 0, total = 0;
        GetParam(0, step);
        try {
            GetResult(0, total);
        } catch (const PropertyException&) {
        }
        SetResult(0, total + step);
    }
};

// One thread's share of the load: mixed operations on objects no other
// thread touches, checked against what the thread itself expects.
class MixedLoad final : public Thread {
public:
    explicit MixedLoad(unsigned seed) : m_seed(seed) {}
    ~MixedLoad() { StopThread(); }

    void OnThread() override {
        std::mt19937 random(m_seed);
        Property store;
        Property view(store);  // a second sharer, read from below
        Tally command;
        Counter counter;
        command.Attach(&counter);
        long expectedTotal = 0, expectedNotifications = 0;
        const auto deadline = Clock::now() + kTimeLimit;
        for (int i = 0; i < kOperations && Clock::now() < deadline; ++i) {
            const int key = static_cast<int>(random() % 64);
            switch (random() % 8) {
                case 0: store.SetValue("k", key, i); m_expected[key] = i; break;
                case 1: {
                    const auto it = m_expected.find(key);
                    try {
                        const int got = store.GetValue("k", key);
                        if (it == m_expected.end() || it->second != got) ++m_errors;
                    } catch (const PropertyException&) {
                        if (it != m_expected.end()) ++m_errors;
                    }
                    break;
                }
                case 2: store.Erase("k", key); m_expected.erase(key); break;
                case 3: store.SetString("t" + std::to_string(key), "text of this thread"); break;
                case 4: {
                    command.SetParam(0, key);
                    command.Run();
                    expectedTotal += key;
                    break;
                }
                case 5: command.SetRunFlag(false); ++expectedNotifications; break;
                case 6: command.SetResult(1, key, i); break;
                default: {
                    std::string name;
                    if (view.getCount() > 0) view.getKey(key % view.getCount(), name);
                    break;
                }
            }
            ++m_done;
        }
        int total = 0;
        try {
            command.GetResult(0, total);
        } catch (const PropertyException&) {
        }
        if (total != expectedTotal || counter.calls != expectedNotifications) ++m_errors;
        command.Detach(&counter);
    }

    static constexpr int kOperations = 100000;
    int done() const { return m_done; }
    int errors() const { return m_errors; }

private:
    unsigned m_seed;
    std::map<int, int> m_expected;
    int m_done = 0;
    int m_errors = 0;
};

// Takes and gives back one named mutex, incrementing a counter that only the
// mutex protects.
class MutexLoad final : public Thread {
public:
    MutexLoad(std::wstring name, long& counter) : m_name(std::move(name)), m_counter(counter) {}
    ~MutexLoad() { StopThread(); }

    void OnThread() override {
        const auto deadline = Clock::now() + kTimeLimit;
        for (int i = 0; i < kRounds && Clock::now() < deadline; ++i) {
            try {
                if (!wait(m_name.c_str(), 10000)) {
                    ++m_errors;
                    continue;
                }
                const long seen = m_counter;  // a lost update would show
                m_counter = seen + 1;
                release(m_name.c_str());
                ++m_done;
            } catch (const ThreadException&) {
                ++m_errors;
            }
        }
    }

    static constexpr int kRounds = 10000;
    int done() const { return m_done; }
    int errors() const { return m_errors; }

private:
    std::wstring m_name;
    long& m_counter;
    int m_done = 0;
    int m_errors = 0;
};

}  // namespace

TEST(Stress, EightThreadsWithTheirOwnStoresAndCommands) {
    std::vector<std::unique_ptr<MixedLoad>> loads;
    for (unsigned i = 0; i < 8; ++i) loads.push_back(std::make_unique<MixedLoad>(1000 + i));
    for (auto& load : loads) load->StartThread();
    for (auto& load : loads) load->StopThread();
    for (auto& load : loads) {
        EXPECT_EQ(load->done(), MixedLoad::kOperations);
        EXPECT_EQ(load->errors(), 0);
    }
}

TEST(Stress, FourThreadsShareOneNamedMutex) {
    const std::wstring name = L"VantorBaseStress." + std::to_wstring(GetCurrentProcessId());
    Mutex mutex(name.c_str());
    long counter = 0;
    std::vector<std::unique_ptr<MutexLoad>> loads;
    for (int i = 0; i < 4; ++i) loads.push_back(std::make_unique<MutexLoad>(name, counter));
    for (auto& load : loads) load->StartThread();
    for (auto& load : loads) load->StopThread();
    long done = 0;
    for (auto& load : loads) {
        EXPECT_EQ(load->errors(), 0);
        done += load->done();
    }
    EXPECT_EQ(done, 4 * MutexLoad::kRounds);
    EXPECT_EQ(counter, done);
    mutex.release();
}
