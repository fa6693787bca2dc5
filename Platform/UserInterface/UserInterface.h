// SPDX-License-Identifier: Apache-2.0
// The toolkit: makes what the application shows. Everything it makes is gone before the toolkit is.
#pragma once

#include <memory>
#include <string_view>

#include "Platform/UserInterface/InterfaceBody.h"
#include "Platform/UserInterface/Label.h"
#include "Platform/UserInterface/NavigationStack.h"
#include "Platform/UserInterface/ViewController.h"
#include "Platform/UserInterface/Window.h"

namespace kelvasi {

class UserInterface {
 public:
  virtual ~UserInterface() = default;

  virtual const Screen& mainScreen() const = 0;
  // The room that one line of text takes in a font.
  virtual Size sizeOfText(std::string_view text, const Font& font) const = 0;

  virtual std::unique_ptr<Window> makeWindow(const Rect& frame) = 0;
  virtual std::unique_ptr<NavigationStack> makeNavigationStack(std::unique_ptr<ViewController> root) = 0;
  virtual std::unique_ptr<TableControllerBody> makeTableControllerBody() = 0;
  // From the interface resource of this name; null when there is none.
  virtual std::unique_ptr<InterfaceBody> loadInterface(std::string_view name) = 0;
  virtual std::unique_ptr<Label> makeLabel() = 0;
  virtual std::unique_ptr<ScrollView> makeScrollView() = 0;

  // Over whatever is shown, until its one button is pressed.
  virtual void showAlert(std::string_view title, std::string_view message, std::string_view button) = 0;
  // Beside whatever is shown, for a while: what became of a file, and its path, which can be copied.
  virtual void showFileNotice(std::string_view message, std::string_view path) = 0;
};

}  // namespace kelvasi
