#include "vantorbase/mvc.h"

#include <stdexcept>

Model::Model() = default;
Model::Model(const Model& other) = default;
Model& Model::operator=(const Model& other) = default;
Model::~Model() = default;

View::View(Model* model) : m_model(model) {
    if (m_model != nullptr) m_model->Attach(this);
}
View::View(const View& other) = default;
View& View::operator=(const View& other) = default;
View::~View() {
    if (m_model != nullptr && m_model->IsExist(this)) m_model->Detach(this);
    m_controller.reset();
}

void View::Update(Subject* subject) { OnUpdate(subject); }

void View::Initialize() {
    m_controller.reset();
    m_controller.reset(CreateController());
}

Model* View::GetModel() { return m_model; }
Controller* View::GetController() { return m_controller.get(); }

namespace {
View* RequireView(View* view) {
    if (view == nullptr) throw std::invalid_argument("Controller::Controller: null view");
    return view;
}
}  // namespace

Controller::Controller(View* view) : m_model(RequireView(view)->GetModel()), m_view(view) {
    if (m_model != nullptr) m_model->Attach(this);
}
Controller::Controller(const Controller& other) = default;
Controller& Controller::operator=(const Controller& other) = default;
Controller::~Controller() {
    if (m_model != nullptr && m_model->IsExist(this)) m_model->Detach(this);
}

void Controller::Update(Subject* subject) { OnUpdate(subject); }

Model* Controller::GetModel() { return m_model; }
View* Controller::GetView() { return m_view; }

bool Controller::OnMsg(HWND, UINT, WPARAM, LPARAM, LRESULT&) { return false; }
LRESULT Controller::OnMsg(HWND, UINT, WPARAM, LPARAM) { return 0; }
