// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/QtUserInterface.h"

#include <QApplication>
#include <QScreen>
#include <QStyleFactory>
#include <algorithm>

#include "Platform/QtWidgets/Accessibility.h"
#include "Platform/QtWidgets/AlertLayer.h"
#include "Platform/QtWidgets/FileNotice.h"
#include "Platform/QtWidgets/Fonts.h"
#include "Platform/QtWidgets/InterfacePage.h"
#include "Platform/QtWidgets/PaintedViews.h"
#include "Platform/QtWidgets/PortalSetting.h"
#include "Platform/QtWidgets/QtNavigationStack.h"
#include "Platform/QtWidgets/QtWindow.h"
#include "Platform/QtWidgets/SystemScheme.h"

namespace kelvasi {

namespace {

constexpr QSize phoneWindow(390, 844);
constexpr int titleBarHeight = 48;  // points, a generous one
constexpr double usualDotsPerInch = 96;
constexpr int phoneSide = 480;  // a screen with a side no longer than this is a phone's

bool isPhone(const QSize& screen) {
  return std::min(screen.width(), screen.height()) <= phoneSide;
}

// With its title bar on the screen, however low that is.
QSize sizeOfWindow(const QScreen& screen, const QSize& wanted) {
  return wanted.boundedTo(screen.availableGeometry().size() - QSize(0, titleBarHeight));
}

}  // namespace

QtUserInterface::QtUserInterface(const Options& options) : options_(options) {
  QApplication::setStyle(QStyleFactory::create(QStringLiteral("Fusion")));
  installAccessibility();
  const QScreen& screen = *QGuiApplication::primaryScreen();
  setTextScale(options.textScale.value_or(screen.logicalDotsPerInch() / usualDotsPerInch));
  if (!options.textScale) followTextScale();
  options_.fullScreen = options.fullScreen || isPhone(screen.size());
  const QSize size =
      options_.fullScreen ? screen.size() : sizeOfWindow(screen, options.windowSize.value_or(phoneWindow));
  screen_.area = {0, 0, static_cast<double>(size.width()), static_cast<double>(size.height())};
  if (!options.colourScheme)
    systemScheme_ = std::make_unique<SystemScheme>([this](ColourScheme scheme) { paint(scheme); });
}

QtUserInterface::~QtUserInterface() {
  QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}

// GNOME's setting. On X11 Qt enlarges everything by it, texts among it.
void QtUserInterface::followTextScale() {
  if (QGuiApplication::platformName() == QLatin1String("xcb")) return;
  systemTextScale_ =
      std::make_unique<PortalSetting>(QStringLiteral("org.gnome.desktop.interface"),
                                      QStringLiteral("text-scaling-factor"), [](const QVariant& scale) {
                                        if (scale.toDouble() > 0) setTextScale(scale.toDouble());
                                      });
}

void QtUserInterface::paint(ColourScheme scheme) {
  if (window_) window_->setPalette(paletteOf(scheme));
}

Size QtUserInterface::sizeOfText(std::string_view text, const Font& font) const {
  return kelvasi::sizeOfText(text, font);
}

std::unique_ptr<Window> QtUserInterface::makeWindow(const Rect& frame) {
  auto window = std::make_unique<QtWindow>(frame, options_.fullScreen);
  window_ = &window->widget();
  paint(systemScheme_ ? systemScheme_->scheme() : *options_.colourScheme);
  return window;
}

std::unique_ptr<NavigationStack> QtUserInterface::makeNavigationStack(std::unique_ptr<ViewController> root) {
  return std::make_unique<QtNavigationStack>(std::move(root), options_.animates);
}

std::unique_ptr<TableControllerBody> QtUserInterface::makeTableControllerBody() {
  return std::make_unique<TablePage>();
}

std::unique_ptr<InterfaceBody> QtUserInterface::loadInterface(std::string_view name) {
  return InterfacePage::load(name);
}

std::unique_ptr<Label> QtUserInterface::makeLabel() {
  return std::make_unique<QtLabel>();
}

std::unique_ptr<ScrollView> QtUserInterface::makeScrollView() {
  return std::make_unique<QtScrollView>();
}

void QtUserInterface::showAlert(std::string_view title, std::string_view message, std::string_view button) {
  if (window_) new AlertLayer(*window_, {qtText(title), qtText(message), qtText(button)});
}

void QtUserInterface::showFileNotice(std::string_view message, std::string_view path) {
  if (window_) new FileNotice(*window_, qtText(message), qtText(path));
}

}  // namespace kelvasi
