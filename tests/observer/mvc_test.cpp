#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <vector>

#include "vantorbase/mvc.h"

namespace {

struct Counters {
    int controllersMade = 0;
    int controllersDestroyed = 0;
    std::vector<std::string> updates;
};

class AppController : public Controller {
public:
    AppController(View* view, Counters& counters) : Controller(view), m_counters(counters) {
        ++m_counters.controllersMade;
    }
    ~AppController() override { ++m_counters.controllersDestroyed; }

protected:
    void OnUpdate(Subject*) override { m_counters.updates.push_back("controller"); }

private:
    Counters& m_counters;
};

class AppView : public View {
public:
    AppView(Model* model, Counters& counters) : View(model), m_counters(counters) {}
    bool failNext = false;

protected:
    void OnUpdate(Subject* subject) override {
        m_counters.updates.push_back(subject == GetModel() ? "view" : "view(other)");
    }
    Controller* CreateController() override {
        if (failNext) throw std::runtime_error("no controller");
        return new AppController(this, m_counters);
    }

private:
    Counters& m_counters;
};

}  // namespace

TEST(ModelViewController, ViewsAndControllersRegisterAndTearDown) {
    Model model;
    Counters counters;
    {
        AppView view(&model, counters);
        EXPECT_EQ(model.GetObserverCount(), 1);
        EXPECT_EQ(view.GetController(), nullptr);
        view.Initialize();
        EXPECT_EQ(model.GetObserverCount(), 2);
        ASSERT_NE(view.GetController(), nullptr);
        EXPECT_EQ(view.GetController()->GetView(), &view);
        EXPECT_EQ(view.GetController()->GetModel(), &model);

        model.Notify();
        EXPECT_EQ(counters.updates, (std::vector<std::string>{"view", "controller"}));

        view.Initialize();  // replaces the controller
        EXPECT_EQ(model.GetObserverCount(), 2);
        EXPECT_EQ(counters.controllersMade, 2);
        EXPECT_EQ(counters.controllersDestroyed, 1);

        view.failNext = true;
        EXPECT_THROW(view.Initialize(), std::runtime_error);
        EXPECT_EQ(view.GetController(), nullptr);
        EXPECT_EQ(counters.controllersDestroyed, 2);
        EXPECT_EQ(model.GetObserverCount(), 1);
        view.failNext = false;
        view.Initialize();
    }
    EXPECT_EQ(model.GetObserverCount(), 0);
    EXPECT_EQ(counters.controllersDestroyed, counters.controllersMade);
}

TEST(ModelViewController, ANullModelAttachesNothing) {
    Counters counters;
    AppView view(nullptr, counters);
    EXPECT_EQ(view.GetModel(), nullptr);
    view.Initialize();
    ASSERT_NE(view.GetController(), nullptr);
    EXPECT_EQ(view.GetController()->GetModel(), nullptr);
    EXPECT_THROW(AppController(nullptr, counters), std::invalid_argument);
}

TEST(ModelViewController, CopiedViewsShareTheControllerAndRegisterNothing) {
    Model model;
    Counters counters;
    AppView source(&model, counters);
    source.Initialize();
    Controller* controller = source.GetController();
    {
        AppView copy(source);
        EXPECT_EQ(model.GetObserverCount(), 2);
        EXPECT_FALSE(model.IsExist(&copy));
        EXPECT_EQ(copy.GetModel(), &model);
        EXPECT_EQ(copy.GetController(), controller);
    }
    // The copy is gone: the source is still listed and its controller alive.
    EXPECT_TRUE(model.IsExist(&source));
    EXPECT_TRUE(model.IsExist(controller));
    EXPECT_EQ(counters.controllersDestroyed, 0);

    // The controller goes once, with the last view that holds it.
    auto* copy = new AppView(source);
    source.Initialize();
    EXPECT_EQ(counters.controllersDestroyed, 0);
    EXPECT_TRUE(model.IsExist(controller));
    delete copy;
    EXPECT_EQ(counters.controllersDestroyed, 1);
    EXPECT_FALSE(model.IsExist(controller));
    EXPECT_EQ(model.GetObserverCount(), 2);
}

