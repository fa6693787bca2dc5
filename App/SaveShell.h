// SPDX-License-Identifier: Apache-2.0
// What panes and the save view ask of the application.
#pragma once

namespace kelvasi {

class SaveShell {
 public:
  virtual bool allowSaveButton() const = 0;
  virtual void showSaveView() = 0;
  virtual void closeSaveView() = 0;

 protected:
  ~SaveShell() = default;
};

}  // namespace kelvasi
