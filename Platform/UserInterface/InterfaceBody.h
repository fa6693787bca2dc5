// SPDX-License-Identifier: Apache-2.0
// A screenful made from an interface resource, its parts found by name.
#pragma once

#include <functional>
#include <string_view>

#include "Platform/UserInterface/TextField.h"
#include "Platform/UserInterface/ViewController.h"

namespace kelvasi {

// The parts live in the body. A name that the resource does not hold yields null.
class InterfaceBody : public ControllerBody {
 public:
  virtual TableView* tableView(std::string_view name) = 0;
  virtual TextField* textField(std::string_view name) = 0;
  // What the control bound to the action of this name does when used.
  virtual void setAction(std::string_view name, std::function<void()> action) = 0;
};

}  // namespace kelvasi
