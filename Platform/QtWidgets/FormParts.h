// SPDX-License-Identifier: Apache-2.0
// What forms are made of: a ground with rounded corners, the ground behind it that can be touched, and texts.
#pragma once

#include <QAbstractButton>
#include <QFrame>
#include <QLabel>

#include "Platform/QtWidgets/ElidedLabel.h"

namespace kelvasi {

// A text whose paths may be broken after each of their parts.
QString breakable(QString text);

// In the colour of its background role.
class Card : public QFrame {
 public:
  explicit Card(QWidget* parent = nullptr);

 protected:
  void paintEvent(QPaintEvent* event) override;
};

// A card in a form whose corners cut what lies on it too.
class ListCard : public Card {
 public:
  explicit ListCard(QWidget* parent = nullptr);

 protected:
  void resizeEvent(QResizeEvent* event) override;
  void childEvent(QChildEvent* event) override;

 private:
  QWidget* corners_ = nullptr;  // a child
};

// Covers a form's background; a click on it is a touch of no other control.
class BackgroundControl : public QAbstractButton {
 public:
  explicit BackgroundControl(QWidget* parent = nullptr);

 protected:
  void paintEvent(QPaintEvent* event) override;
};

class FormTitle : public ElidedLabel {
 public:
  explicit FormTitle(QWidget* parent = nullptr);
};

// Above a card.
class FormHeading : public QLabel {
 public:
  explicit FormHeading(QWidget* parent = nullptr);
};

}  // namespace kelvasi
