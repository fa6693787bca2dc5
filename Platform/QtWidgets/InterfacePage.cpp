// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/InterfacePage.h"

#include <QVariant>
#include <algorithm>
#include <array>

#include "Platform/QtWidgets/FormParts.h"
#include "ui_KelvasiSaveViewController.h"

namespace kelvasi {

namespace {

template <typename Form>
void setUp(QWidget& widget) {
  Form().setupUi(&widget);
}

struct Resource {
  std::string_view name;
  void (*setUp)(QWidget& widget);
};

constexpr std::array resources{
    Resource{"KelvasiSaveViewController", setUp<Ui::KelvasiSaveViewController>},
};

}  // namespace

std::unique_ptr<InterfacePage> InterfacePage::load(std::string_view name) {
  const auto resource = std::ranges::find(resources, name, &Resource::name);
  if (resource == resources.end()) return nullptr;
  std::unique_ptr<QWidget, DeleteLater> form(new BackgroundControl);
  resource->setUp(*form);
  return std::unique_ptr<InterfacePage>(new InterfacePage(std::move(form)));
}

QWidget* InterfacePage::find(std::string_view name) {
  return widget().findChild<QWidget*>(qtText(name));
}

TableView* InterfacePage::tableView(std::string_view name) {
  return dynamic_cast<TableWidget*>(find(name));
}

TextField* InterfacePage::textField(std::string_view name) {
  auto* const edit = qobject_cast<QLineEdit*>(find(name));
  if (!edit) return nullptr;
  auto& field = fields_[std::string(name)];
  if (!field) field = std::make_unique<QtTextField>(*edit);
  return field.get();
}

void InterfacePage::setAction(std::string_view name, std::function<void()> action) {
  auto buttons = widget().findChildren<QAbstractButton*>();
  buttons.append(dynamic_cast<QAbstractButton*>(&widget()));
  for (QAbstractButton* const button : buttons) {
    if (button->property("action").toString() == qtText(name))
      QObject::connect(button, &QAbstractButton::clicked, &actions_, [action] { action(); });
  }
}

QWidget& InterfacePage::firstFocus() {
  QWidget* const field = widget().findChild<QLineEdit*>();
  return field ? *field : widget();
}

}  // namespace kelvasi
