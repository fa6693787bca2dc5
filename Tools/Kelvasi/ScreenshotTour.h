// Leads the real window through a few panes by its keyboard and keeps a picture of each, for documents and
// for a look where there is no display.
#pragma once

#include <QString>
#include <QTimer>
#include <functional>
#include <vector>

class QWidget;

namespace kelvasi {

class TableWidget;

class ScreenshotTour {
 public:
  // Writes root.png, deep.png, long-value.png and save-view.png into `directory`, which must exist, then ends
  // the event loop. What the display or the installation does not have is left out and said on the standard
  // error. Does nothing without a directory.
  explicit ScreenshotTour(const std::string& directory);

 private:
  // Whether it is done; asked again after a while otherwise.
  using Step = std::function<bool()>;

  std::vector<Step> steps();
  void advance();
  void press(int key, Qt::KeyboardModifiers modifiers = Qt::NoModifier) const;
  void type(const QString& text) const;
  void shoot(const char* name) const;
  bool hasRows() const;
  bool lookForLongValue();
  bool scrollLongValue() const;
  bool openNextBranch();

  QString directory_;
  std::vector<Step> steps_;
  std::size_t at_ = 0;
  int patience_ = 0;                   // turns left for the present step
  std::vector<std::size_t> tried_{0};  // how many rows of each open pane have been looked into
  QTimer turn_;
};

}  // namespace kelvasi
