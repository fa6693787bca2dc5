// SPDX-License-Identifier: Apache-2.0
// What a pane needs around it: nodes to show, and a shell.
#pragma once

#include <memory>
#include <utility>

#include "App/SaveShell.h"
#include "Model/KelvasiModelNode.h"

namespace kelvasi::test {

struct FakeShell : SaveShell {
  bool allowSaveButton() const override { return allows; }
  void showSaveView() override { ++shown; }
  void closeSaveView() override {}
  void keepDescription(std::string) override {}
  bool allows = false;
  int shown = 0;
};

inline NodeRef leaf(const char* name, const char* value) {
  return std::make_shared<KelvasiModelLeafNode>(name, value);
}
inline NodeRef branch(const char* name, NodeList children = {}) {
  return std::make_shared<KelvasiModelTreeNode>(name, std::move(children));
}

}  // namespace kelvasi::test
