// SPDX-License-Identifier: Apache-2.0
// A page made from an interface resource. The resources are compiled in: Qt Designer's files in Resources/ go
// through uic, so that a fault in one stops the build and no reader of such files is needed to run.
#pragma once

#include <QObject>
#include <map>
#include <memory>
#include <string>
#include <string_view>

#include "Platform/QtWidgets/Page.h"
#include "Platform/QtWidgets/QtTextField.h"
#include "Platform/UserInterface/InterfaceBody.h"

namespace kelvasi {

// Parts are found by object name; a button's dynamic property "action" names the action that it is bound to.
class InterfacePage : public PageBody<InterfaceBody> {
 public:
  // Null when there is no resource of this name.
  static std::unique_ptr<InterfacePage> load(std::string_view name);

  TableView* tableView(std::string_view name) override;
  TextField* textField(std::string_view name) override;
  void setAction(std::string_view name, std::function<void()> action) override;
  // The first field, where there is one.
  QWidget& firstFocus() override;

 private:
  explicit InterfacePage(std::unique_ptr<QWidget, DeleteLater> form) : PageBody(std::move(form)) {}

  QWidget* find(std::string_view name);

  std::map<std::string, std::unique_ptr<QtTextField>, std::less<>> fields_;
  QObject actions_;  // ends them with the page: its widgets go a little later
};

}  // namespace kelvasi
