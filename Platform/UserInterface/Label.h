// SPDX-License-Identifier: Apache-2.0
// One line of text.
#pragma once

#include <string>
#include <string_view>

#include "Platform/UserInterface/Font.h"
#include "Platform/UserInterface/View.h"

namespace kelvasi {

enum class TextAlignment { left, centre, right };

class Label : public View {
 public:
  virtual void setText(std::string_view text) = 0;
  virtual const std::string& text() const = 0;
  virtual void setFont(const Font& font) = 0;
  virtual void setAlignment(TextAlignment alignment) = 0;
};

}  // namespace kelvasi
