// SPDX-License-Identifier: Apache-2.0
// What panes and the save view ask of the application.
#pragma once

#include <string>

namespace kelvasi {

class SaveShell {
 public:
  virtual bool allowSaveButton() const = 0;
  virtual void showSaveView() = 0;
  virtual void closeSaveView() = 0;
  // The next save view begins with this description; empty for none.
  virtual void keepDescription(std::string description) = 0;

 protected:
  ~SaveShell() = default;
};

}  // namespace kelvasi
