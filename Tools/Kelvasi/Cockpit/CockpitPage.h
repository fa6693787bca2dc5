// SPDX-License-Identifier: Apache-2.0
// A page of the cockpit, with a title.
#pragma once

#include <QLineEdit>
#include <QWidget>

#include "Tools/Kelvasi/Cockpit/BlockView.h"

namespace kelvasi {

class CockpitPage : public QWidget {
 public:
  CockpitPage(QString title, QWidget* parent) : QWidget(parent), title_(std::move(title)) {}
  const QString& title() const { return title_; }
  // What is shown may have changed.
  virtual void refresh() = 0;
  virtual QWidget& firstFocus() { return *this; }
  // The page's own keys; false for those that it does not know.
  virtual bool takeKey(const QKeyEvent& /*event*/) { return false; }
  // What the page says, a line each.
  virtual QStringList texts() const { return {}; }
  // What it says at the keyboard; empty where the keyboard is at none of it.
  virtual QString selectedText() const { return {}; }

 private:
  QString title_;
};

class BlockPage : public CockpitPage {
 public:
  BlockPage(QString title, QWidget* parent, BlockView::Make make);
  void refresh() override { view_->refresh(); }
  QWidget& firstFocus() override { return *view_; }
  QStringList texts() const override;
  QString selectedText() const override { return view_->selectedText(); }
  BlockView& view() { return *view_; }

 private:
  BlockView* view_;  // a child
};

// A field, and below it what was found for its text.
class SearchPage : public CockpitPage {
 public:
  using Find = std::function<Blocks(const QString& text, double width)>;
  SearchPage(QString title, QString placeholder, QWidget* parent, Find find);
  void refresh() override { view_->refresh(); }
  QWidget& firstFocus() override { return *field_; }
  QStringList texts() const override;
  QString selectedText() const override { return view_->selectedText(); }
  QLineEdit& field() { return *field_; }

 protected:
  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  QLineEdit* field_;  // children
  BlockView* view_;
};

}  // namespace kelvasi
