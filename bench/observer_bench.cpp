// Observers: notification over many observers, attach and detach.
#include <memory>
#include <string>
#include <vector>

#include "harness.h"
#include "vantorbase/observer.h"

namespace {

class Counter : public Observer {
public:
    void Update(Subject*) override { ++count; }
    long long count = 0;
};

std::vector<std::unique_ptr<Counter>> MakeCounters(int n) {
    std::vector<std::unique_ptr<Counter>> counters;
    for (int i = 0; i < n; ++i) counters.push_back(std::make_unique<Counter>());
    return counters;
}

// Time per operation of attaching n observers, then detaching them all.
double AttachDetachNs(int n) {
    const auto counters = MakeCounters(n);
    Subject subject;
    const double pass = bench::Measure([&](std::int64_t iterations) {
        for (std::int64_t it = 0; it < iterations; ++it) {
            for (const auto& c : counters) subject.Attach(c.get());
            for (const auto& c : counters) subject.Detach(c.get());
        }
    });
    return pass / (2.0 * n);
}

}  // namespace

VANTORBASE_BENCH_GROUP(observer_notify) {
    const auto counters = MakeCounters(1000);
    std::vector<Observer*> plain;
    Subject subject;
    for (const auto& c : counters) {
        plain.push_back(c.get());
        subject.Attach(c.get());
    }
    const double loop = bench::Measure([&](std::int64_t iterations) {
        for (std::int64_t it = 0; it < iterations; ++it)
            for (Observer* o : plain) o->Update(&subject);
    });
    bench::ReportBaseline("virtual Update loop over vector<Observer*>, 1000", loop);
    const double notify = bench::Measure([&](std::int64_t iterations) {
        for (std::int64_t it = 0; it < iterations; ++it) subject.Notify();
    });
    bench::Report("Notify() over 1000 observers", notify, "of the loop", loop);
}

VANTORBASE_BENCH_GROUP(observer_attach_detach) {
    const double small = AttachDetachNs(100);
    bench::ReportBaseline("Attach+Detach per operation, n=100", small);
    bench::Report("Attach+Detach per operation, n=10000", AttachDetachNs(10000), "of n=100", small);
}
