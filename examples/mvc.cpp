// A model with a view that prints what it is told, and the controller that
// the view makes for itself: notification reaches both, in order, and
// teardown leaves the model's list empty.
#include <cstdio>

#include "vantorbase/vantorbase.h"

namespace home {

class Thermostat : public Model {
public:
    void SetTemperature(int degrees) {
        SetValue("Temperature", degrees);
        Notify();
    }
};

}  // namespace home

namespace {

class DialController : public Controller {
public:
    using Controller::Controller;
    ~DialController() override { std::printf("  controller destroyed\n"); }

protected:
    void OnUpdate(Subject* subject) override {
        const int degrees = static_cast<Model*>(subject)->GetValue("Temperature");
        std::printf("  controller: %s heating\n", degrees < 20 ? "switch on" : "switch off");
    }
};

class DialView : public View {
public:
    using View::View;

protected:
    void OnUpdate(Subject* subject) override {
        auto* model = static_cast<Model*>(subject);
        std::printf("  view: %s shows %d degrees\n", model->GetSubjectName().c_str(),
                    model->GetValue("Temperature"));
    }
    Controller* CreateController() override {
        std::printf("  view: making its controller\n");
        return new DialController(this);
    }
};

}  // namespace

int main() {
    home::Thermostat thermostat;
    {
        DialView view(&thermostat);
        std::printf("observers after the view: %d\n", thermostat.GetObserverCount());
        view.Initialize();
        std::printf("observers after Initialize: %d\n", thermostat.GetObserverCount());
        std::printf("temperature 18:\n");
        thermostat.SetTemperature(18);
        std::printf("temperature 23:\n");
        thermostat.SetTemperature(23);
        std::printf("tearing the view down:\n");
    }
    std::printf("observers after teardown: %d\n", thermostat.GetObserverCount());
    return 0;
}
