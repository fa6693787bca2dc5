// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/Cockpit/CockpitPage.h"

#include <QKeyEvent>
#include <QVBoxLayout>

#include "Platform/QtWidgets/Fonts.h"

namespace kelvasi {

namespace {

QVBoxLayout* bareLayout(QWidget& page) {
  auto* const layout = new QVBoxLayout(&page);
  layout->setContentsMargins(0, 0, 0, 0);
  layout->setSpacing(0);
  return layout;
}

QStringList textsOf(const BlockView& view) {
  QStringList texts;
  for (const Block& block : view.blocks())
    if (!block.spoken.isEmpty()) texts.append(block.spoken);
  return texts;
}

}  // namespace

BlockPage::BlockPage(QString title, QWidget* parent, BlockView::Make make)
    : CockpitPage(std::move(title), parent), view_(new BlockView(this, std::move(make))) {
  bareLayout(*this)->addWidget(view_);
  view_->setAccessibleName(this->title());
}

QStringList BlockPage::texts() const {
  return textsOf(*view_);
}

SearchPage::SearchPage(QString title, QString placeholder, QWidget* parent, Find find)
    : CockpitPage(std::move(title), parent),
      field_(new QLineEdit(this)),
      view_(new BlockView(
          this, [this, find = std::move(find)](double width) { return find(field_->text(), width); })) {
  field_->setPlaceholderText(placeholder);
  field_->setAccessibleName(placeholder);
  field_->setFont(qtFont(Font::system(textSize::text)));
  field_->setMinimumHeight(static_cast<int>(leastRow));
  field_->setTextMargins(static_cast<int>(pageMargin) - 2, 0, static_cast<int>(pageMargin) - 2, 0);
  field_->setFrame(false);
  field_->installEventFilter(this);
  connect(field_, &QLineEdit::textChanged, this, [this] { view_->refresh(); });
  auto* const layout = bareLayout(*this);
  layout->addWidget(field_);
  layout->addWidget(view_, 1);
  view_->setAccessibleName(this->title());
}

QStringList SearchPage::texts() const {
  return textsOf(*view_);
}

// Down goes to what was found; Enter opens the first of it.
bool SearchPage::eventFilter(QObject* watched, QEvent* event) {
  if (watched != field_ || event->type() != QEvent::KeyPress) return QWidget::eventFilter(watched, event);
  const int key = dynamic_cast<QKeyEvent&>(*event).key();
  const bool isEnter = key == Qt::Key_Return || key == Qt::Key_Enter;
  if (key != Qt::Key_Down && !isEnter) return false;
  if (!view_->select(true)) return true;
  view_->setFocus();
  if (isEnter) {
    const auto action = view_->blocks()[*view_->selected()].action;
    action();
  }
  return true;
}

}  // namespace kelvasi
