// VantorBase: a small model/view/controller skeleton on the observer
// mechanism.
//
// A Model is a subject. A View observes one model and owns one controller,
// which it makes through CreateController when initialised. A Controller
// observes the model of its view and offers two overridable window-message
// handlers, which the application calls from its own window procedure.
//
//   class Panel : public View {
//   public:
//       using View::View;
//   protected:
//       void OnUpdate(Subject*) override { /* redraw */ }
//       Controller* CreateController() override { return new PanelController(this); }
//   };
//   Model model;
//   Panel panel(&model);     // attached to the model
//   panel.Initialize();      // makes and attaches the controller
//   model.Notify();          // the panel's OnUpdate, then its controller's
//
// Views and controllers attach themselves on construction and detach
// themselves on destruction; the model must outlive them. Copies register
// nothing: a copied view is not attached, shares its source's model and
// controller, and the controller is destroyed once, when the last view that
// holds it goes.
#ifndef VANTORBASE_MVC_H
#define VANTORBASE_MVC_H

#include <memory>

#include "vantorbase/export.h"
#include "vantorbase/observer.h"
#include "vantorbase/platform.h"

VANTORBASE_SUPPRESS_DLL_INTERFACE_WARNINGS

class Controller;

// A subject for views and controllers to observe.
class VANTORBASE_API Model : public Subject {
public:
    Model();
    Model(const Model& other);
    Model& operator=(const Model& other);
    ~Model() override;
};

// The base of an application's views.
class VANTORBASE_API View : public Observer {
public:
    // Attaches the view to the model unless the model is null.
    explicit View(Model* model);
    // Shares the source's model and controller; attaches nothing.
    View(const View& other);
    View& operator=(const View& other);
    // Detaches the view from its model if it is listed there, then releases
    // the controller (destroying it if no other view holds it).
    ~View() override;

    // Forwards to OnUpdate.
    void Update(Subject* subject) override;

    // Releases the controller held before, then holds a new one from
    // CreateController. If CreateController throws, the view holds none.
    virtual void Initialize();

    Model* GetModel();
    // Null before Initialize.
    Controller* GetController();

protected:
    // The application's reaction to a notification.
    virtual void OnUpdate(Subject* subject) = 0;
    // A new controller for this view (normally `new MyController(this)`);
    // the view takes ownership.
    virtual Controller* CreateController() = 0;

private:
    Model* m_model;
    std::shared_ptr<Controller> m_controller;
};

// The base of an application's controllers.
class VANTORBASE_API Controller : public Observer {
public:
    // Takes the view's model and attaches to it unless it is null.
    // Throws std::invalid_argument if `view` is null.
    explicit Controller(View* view);
    // Refers to the source's model and view; attaches nothing.
    Controller(const Controller& other);
    Controller& operator=(const Controller& other);
    // Detaches the controller from its model if it is listed there.
    ~Controller() override;

    // Forwards to OnUpdate.
    void Update(Subject* subject) override;

    Model* GetModel();
    View* GetView();

    // Window-message handlers for the application's window procedure. The
    // first returns whether it handled the message and then sets `result`;
    // by default it returns false and leaves `result` alone. The second
    // returns the message's result; by default 0.
    virtual bool OnMsg(HWND window, UINT message, WPARAM wParam, LPARAM lParam, LRESULT& result);
    virtual LRESULT OnMsg(HWND window, UINT message, WPARAM wParam, LPARAM lParam);

protected:
    // The application's reaction to a notification.
    virtual void OnUpdate(Subject* subject) = 0;

private:
    Model* m_model;
    View* m_view;
};

VANTORBASE_RESTORE_WARNINGS

#endif  // VANTORBASE_MVC_H
