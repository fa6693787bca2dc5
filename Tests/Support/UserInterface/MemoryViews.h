// SPDX-License-Identifier: Apache-2.0
// Views that are never drawn but remember what they were told.
#pragma once

#include <algorithm>
#include <optional>
#include <string>
#include <vector>

#include "Platform/UserInterface/Label.h"
#include "Platform/UserInterface/TextField.h"
#include "Platform/UserInterface/View.h"

namespace kelvasi::test {

class MemoryPart;

// The views that a container shows.
class Subviews {
 public:
  ~Subviews();
  void add(MemoryPart& part);
  void remove(MemoryPart& part) { std::erase(parts_, &part); }
  const std::vector<MemoryPart*>& parts() const { return parts_; }

 private:
  std::vector<MemoryPart*> parts_;
};

// What every view in memory is besides.
class MemoryPart {
 public:
  MemoryPart() = default;
  virtual ~MemoryPart() {
    if (in_) in_->remove(*this);
  }
  MemoryPart(const MemoryPart&) = delete;
  MemoryPart& operator=(const MemoryPart&) = delete;

  bool isIn(const Subviews& container) const { return in_ == &container; }

 private:
  friend class Subviews;
  Subviews* in_ = nullptr;
};

inline Subviews::~Subviews() {
  for (MemoryPart* part : parts_) part->in_ = nullptr;
}
inline void Subviews::add(MemoryPart& part) {
  if (part.in_) part.in_->remove(part);
  part.in_ = this;
  parts_.push_back(&part);
}

template <typename Interface>
class MemoryView : public Interface, public MemoryPart {
 public:
  void setFrame(const Rect& frame) override { frameSet = frame; }
  Rect bounds() const override { return {0, 0, frameSet.width, frameSet.height}; }
  Rect frameSet;
};

template <typename Interface>
class MemoryContainer : public MemoryView<Interface> {
 public:
  void addSubview(View& view) override { subviews.add(dynamic_cast<MemoryPart&>(view)); }
  Subviews subviews;
};

class MemoryLabel : public MemoryView<Label> {
 public:
  void setText(std::string_view text) override { text_ = text; }
  const std::string& text() const override { return text_; }
  void setFont(const Font& font) override { fontSet = font; }
  void setAlignment(TextAlignment alignment) override { alignmentSet = alignment; }

  Font fontSet;
  std::optional<TextAlignment> alignmentSet;

 private:
  std::string text_;
};

class MemoryScrollView : public MemoryContainer<ScrollView> {
 public:
  void setContentSize(Size size) override { contentSize = size; }
  Size contentSize;
};

class MemoryTextField : public MemoryView<TextField> {
 public:
  void setDelegate(TextFieldDelegate* itsDelegate) override { delegate = itsDelegate; }
  std::optional<std::string> text() const override { return typed; }
  void setText(std::string_view text) override { typed = text; }
  void resignFirstResponder() override { hasKeyboard = false; }

  bool pressReturn() { return delegate->textFieldShouldReturn(*this); }

  TextFieldDelegate* delegate = nullptr;
  std::optional<std::string> typed = "";
  bool hasKeyboard = true;
};

}  // namespace kelvasi::test
