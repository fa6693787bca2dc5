// SPDX-License-Identifier: Apache-2.0
// A field for one line of text.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "Platform/UserInterface/View.h"

namespace kelvasi {

class TextField;

class TextFieldDelegate {
 public:
  // The return key was pressed; the answer says whether the field shall handle it as it usually does.
  virtual bool textFieldShouldReturn(TextField& textField) = 0;

 protected:
  ~TextFieldDelegate() = default;
};

class TextField : public View {
 public:
  // Null for none; the delegate outlives the field or takes itself off.
  virtual void setDelegate(TextFieldDelegate* delegate) = 0;
  virtual std::optional<std::string> text() const = 0;
  virtual void setText(std::string_view text) = 0;
  // Gives up the keyboard.
  virtual void resignFirstResponder() = 0;
};

}  // namespace kelvasi
