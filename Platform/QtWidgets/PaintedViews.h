// SPDX-License-Identifier: Apache-2.0
// Labels and scrollable views that have no widget of their own: the widget of their row draws them, at
// exactly the place that they were given.
#pragma once

#include <QPainter>
#include <QStringList>
#include <functional>
#include <string>
#include <vector>

#include "Platform/UserInterface/Label.h"
#include "Platform/UserInterface/View.h"

namespace kelvasi {

class PaintedGroup;
class QtScrollView;

inline QRectF qtRect(const Rect& rect) {
  return {rect.x, rect.y, rect.width, rect.height};
}

class PaintedPart {
 public:
  PaintedPart() = default;
  virtual ~PaintedPart();
  PaintedPart(const PaintedPart&) = delete;
  PaintedPart& operator=(const PaintedPart&) = delete;

  // In the coordinates of the group; the painter's pen has the colour of texts, its brush that of the ground.
  virtual void paint(QPainter& painter) const = 0;
  // Appends every text, in the order in which the views were added.
  virtual void collectTexts(QStringList& texts) const = 0;
  virtual QtScrollView* asScrollView() { return nullptr; }

 protected:
  void place(const Rect& frame);
  // Has the widget drawn anew.
  void changed() const;
  const Rect& frame() const { return frame_; }

 private:
  friend class PaintedGroup;
  PaintedGroup* group_ = nullptr;
  Rect frame_;
};

// The views that are drawn together.
class PaintedGroup {
 public:
  explicit PaintedGroup(std::function<void()> changed) : changed_(std::move(changed)) {}
  ~PaintedGroup();
  PaintedGroup(const PaintedGroup&) = delete;
  PaintedGroup& operator=(const PaintedGroup&) = delete;

  // `view` is one that this toolkit made.
  void add(View& view);
  void paint(QPainter& painter) const;
  void collectTexts(QStringList& texts) const;
  // How far to the right its views reach.
  double right() const;
  // The first one among them; null when there is none.
  QtScrollView* scrollView() const;

 private:
  friend class PaintedPart;
  std::function<void()> changed_;
  std::vector<PaintedPart*> parts_;
};

class QtLabel : public Label, public PaintedPart {
 public:
  void setFrame(const Rect& frame) override { place(frame); }
  Rect bounds() const override { return {0, 0, frame().width, frame().height}; }
  void setText(std::string_view text) override;
  const std::string& text() const override { return text_; }
  void setFont(const Font& font) override;
  void setAlignment(TextAlignment alignment) override;

  // A text that is wider than its frame then ends in an ellipsis.
  void setElided(bool elided) { isElided_ = elided; }

  void paint(QPainter& painter) const override;
  void collectTexts(QStringList& texts) const override;

 private:
  // Regular text in a frame that was measured in the bold font fills the frame.
  double spreadTo(const QString& text) const;

  std::string text_;
  QString shown_;
  Font font_ = Font::system(17);
  TextAlignment alignment_ = TextAlignment::left;
  bool isElided_ = false;
};

class QtScrollView : public ScrollView, public PaintedPart {
 public:
  void setFrame(const Rect& frame) override;
  Rect bounds() const override { return {offset_, 0, frame().width, frame().height}; }
  void addSubview(View& view) override { group_.add(view); }
  void setContentSize(Size size) override;

  // How far the content is moved to the left, 0 to furthestOffset().
  double offset() const { return offset_; }
  double furthestOffset() const;
  void scrollTo(double offset);

  void paint(QPainter& painter) const override;
  void collectTexts(QStringList& texts) const override { group_.collectTexts(texts); }
  QtScrollView* asScrollView() override { return this; }

 private:
  void paintHidden(QPainter& painter, Qt::Edge edge) const;

  Size contentSize_;
  double offset_ = 0;
  PaintedGroup group_{[this] { changed(); }};
};

}  // namespace kelvasi
