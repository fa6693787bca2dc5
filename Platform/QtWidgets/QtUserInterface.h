// SPDX-License-Identifier: Apache-2.0
// The toolkit on Qt's widgets. Needs a QApplication that outlives it; one at a time.
#pragma once

#include <QPointer>
#include <memory>
#include <optional>

#include "Platform/QtWidgets/Palettes.h"
#include "Platform/QtWidgets/TopWidget.h"
#include "Platform/UserInterface/UserInterface.h"

namespace kelvasi {

class PortalSetting;
class SystemScheme;

class QtUserInterface : public UserInterface {
 public:
  struct Options {
    bool fullScreen = false;                         // always on a screen that is no larger than a phone's
    std::optional<QSize> windowSize = std::nullopt;  // a phone's unless stated
    std::optional<double> textScale = std::nullopt;  // the desktop's unless stated
    std::optional<ColourScheme> colourScheme = std::nullopt;  // the system's unless stated
    bool animates = true;
  };

  explicit QtUserInterface(const Options& options);
  ~QtUserInterface() override;

  const Screen& mainScreen() const override { return screen_; }
  Size sizeOfText(std::string_view text, const Font& font) const override;
  std::unique_ptr<Window> makeWindow(const Rect& frame) override;
  std::unique_ptr<NavigationStack> makeNavigationStack(std::unique_ptr<ViewController> root) override;
  std::unique_ptr<TableControllerBody> makeTableControllerBody() override;
  std::unique_ptr<InterfaceBody> loadInterface(std::string_view name) override;
  std::unique_ptr<Label> makeLabel() override;
  std::unique_ptr<ScrollView> makeScrollView() override;
  // Over the newest window.
  void showAlert(std::string_view title, std::string_view message, std::string_view button) override;
  void showFileNotice(std::string_view message, std::string_view path) override;

  // The newest; null before there is one.
  TopWidget* window() const { return window_; }

 private:
  struct WindowScreen : Screen {
    Rect bounds() const override { return area; }
    Rect applicationFrame() const override { return area; }  // a window has no status bar
    Rect area;
  };

  void paint(ColourScheme scheme);
  void followTextScale();

  Options options_;
  WindowScreen screen_;
  std::unique_ptr<SystemScheme> systemScheme_;
  std::unique_ptr<PortalSetting> systemTextScale_;
  QPointer<TopWidget> window_;
};

}  // namespace kelvasi
