#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <stdexcept>
#include <string>
#include <vector>

#include "debug_capture.h"
#include "vantorbase/mvc.h"
#include "vantorbase/observer.h"

namespace {

// An observer that records its calls in a shared log and may act on them.
class Probe : public Observer {
public:
    Probe(std::string name, std::vector<std::string>& log) : m_name(std::move(name)), m_log(log) {}
    void Update(Subject* subject) override {
        m_log.push_back(m_name);
        last = subject;
        if (action) action(subject);
    }
    Subject* last = nullptr;
    std::function<void(Subject*)> action;

private:
    std::string m_name;
    std::vector<std::string>& m_log;
};

using Log = std::vector<std::string>;

}  // namespace

namespace app {
class VolumeModel : public Model {};
}  // namespace app

class DerivedModel : public Model {};

TEST(Subject, ListsEachObserverOnceInOrderOfAttachment) {
    Subject subject;
    Log log;
    Probe a("a", log), b("b", log);
    subject.Attach(&a);
    subject.Attach(&a);
    subject.Attach(nullptr);
    subject.Attach(&b);
    EXPECT_EQ(subject.GetObserverCount(), 2);
    EXPECT_EQ(subject.GetObserver(0), &a);
    EXPECT_EQ(subject.GetObserver(1), &b);
    EXPECT_EQ(subject.GetObserver(-1), nullptr);
    EXPECT_EQ(subject.GetObserver(2), nullptr);
    subject.Detach(&a);
    EXPECT_FALSE(subject.IsExist(&a));
    EXPECT_EQ(subject.GetObserver(0), &b);
    subject.Detach(&a);  // not listed: nothing
    EXPECT_EQ(subject.GetObserverCount(), 1);
    subject.Attach(&a);  // re-attached at the end
    EXPECT_EQ(subject.GetObserver(1), &a);
}

TEST(Subject, NotifiesInOrderWithTheRightSubject) {
    Subject subject, other;
    Log log;
    Probe a("a", log), b("b", log);
    DebugCapture capture;
    subject.Notify();  // no observers: nothing happens, nothing is written
    subject.Attach(&a);
    subject.Attach(&b);
    subject.Notify();
    EXPECT_EQ(log, (Log{"a", "b"}));
    EXPECT_EQ(a.last, &subject);
    subject.Notify(nullptr);
    EXPECT_EQ(b.last, nullptr);
    subject.Notify(&other);
    EXPECT_EQ(a.last, &other);
    // A subject attached to another receives it and, by default, ignores it.
    other.Attach(&subject);
    other.Notify();
    EXPECT_EQ(log.size(), 6u);
    EXPECT_TRUE(capture.Texts().empty());
}

TEST(Subject, AThrowingUpdateEndsTheWalkAndIsReportedOnce) {
    Subject subject;
    Log log;
    Probe a("a", log), b("b", log), c("c", log);
    b.action = [](Subject*) { throw std::runtime_error("b fails"); };
    subject.Attach(&a);
    subject.Attach(&b);
    subject.Attach(&c);
    DebugCapture capture;
    subject.Notify();
    EXPECT_EQ(log, (Log{"a", "b"}));
    EXPECT_EQ(capture.Texts(), std::vector<std::wstring>{L"\nObserver Notify Exception!!!"});
    b.action = [](Subject*) { throw 42; };  // not a std::exception either
    subject.Notify();
    EXPECT_EQ(log, (Log{"a", "b", "a", "b"}));
    EXPECT_EQ(capture.Texts().size(), 2u);
}

TEST(Subject, TheWalkSurvivesChangesMadeFromInsideUpdate) {
    Subject subject;
    Log log;
    Probe once("once", log), killer("killer", log), victim("victim", log), adder("adder", log),
        late("late", log), nested("nested", log);
    once.action = [&](Subject* s) { s->Detach(&once); };
    killer.action = [&](Subject* s) {
        const bool listed = s->IsExist(&victim);
        const int before = s->GetObserverCount();
        s->Detach(&victim);
        // Detached observers are gone from the queries at once, mid-walk.
        EXPECT_FALSE(s->IsExist(&victim));
        EXPECT_EQ(s->GetObserverCount(), before - (listed ? 1 : 0));
        EXPECT_EQ(s->GetObserver(0), &killer);
        EXPECT_EQ(s->GetObserver(1), &adder);
        EXPECT_EQ(s->GetObserver(2), &nested);
    };
    adder.action = [&](Subject* s) { s->Attach(&late); };
    subject.Attach(&once);
    subject.Attach(&killer);
    subject.Attach(&adder);
    subject.Attach(&victim);
    subject.Attach(&nested);
    nested.action = [&](Subject* s) {
        nested.action = nullptr;  // one nested walk
        s->Notify();
    };
    subject.Notify();
    EXPECT_EQ(log, (Log{"once", "killer", "adder", "nested", "killer", "adder", "nested", "late",
                        "late"}));
    EXPECT_EQ(subject.GetObserverCount(), 4);
    EXPECT_EQ(subject.GetObserver(0), &killer);
    EXPECT_EQ(subject.GetObserver(3), &late);

    // Everyone detaches everyone, itself included: the walk ends cleanly.
    log.clear();
    killer.action = [&](Subject* s) {
        for (Observer* o : {static_cast<Observer*>(&killer), static_cast<Observer*>(&adder),
                            static_cast<Observer*>(&nested), static_cast<Observer*>(&late)})
            s->Detach(o);
    };
    subject.Notify();
    EXPECT_EQ(log, (Log{"killer"}));
    EXPECT_EQ(subject.GetObserverCount(), 0);
}

TEST(Subject, CopiesShareTheListAndTheStore) {
    Log log;
    Probe a("a", log), b("b", log);
    Subject source;
    source.Attach(&a);
    {
        Subject copy(source);
        copy.Attach(&b);
        EXPECT_EQ(source.GetObserverCount(), 2);
        copy.SetValue("k", 1);
        EXPECT_EQ(source.GetValue("k"), 1);
        Subject assigned;
        assigned = copy;
        assigned.Notify();
        EXPECT_EQ(a.last, &assigned);
    }
    // The copies are gone; the list lives on with the source.
    EXPECT_EQ(source.GetObserverCount(), 2);
    source.Notify();
    EXPECT_EQ(log, (Log{"a", "b", "a", "b"}));

    // An Update that destroys the only subject holding the list: the walk
    // still finishes over the list it started with.
    auto owned = std::make_unique<Subject>();
    Probe c("c", log), d("d", log);
    c.action = [&](Subject*) { owned.reset(); };
    owned->Attach(&c);
    owned->Attach(&d);
    log.clear();
    owned->Notify();
    EXPECT_EQ(log, (Log{"c", "d"}));
}

TEST(Subject, NamesTheMostDerivedClass) {
    Model model;
    DerivedModel derived;
    app::VolumeModel inNamespace;
    EXPECT_EQ(model.GetSubjectName(), "Model");
    EXPECT_EQ(model.GetSubjectNameW(), L"Model");
    EXPECT_EQ(derived.GetSubjectName(), "DerivedModel");
    EXPECT_EQ(inNamespace.GetSubjectName(), "app::VolumeModel");
    Subject& base = inNamespace;
    EXPECT_EQ(base.GetSubjectName(), "app::VolumeModel");
}

TEST(Observer, DeletingThroughABasePointerReachesTheDerivedDestructor) {
    static int destroyed = 0;
    struct Counted : Observer {
        ~Counted() override { ++destroyed; }
        void Update(Subject*) override {}
    };
    Observer* observer = new Counted;
    delete observer;
    Subject* subject = new app::VolumeModel;
    delete subject;
    EXPECT_EQ(destroyed, 1);
}
