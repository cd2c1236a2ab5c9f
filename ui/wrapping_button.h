#pragma once

#include <QPushButton>

// A push button whose caption wraps onto several lines, like a long caption on a tall button.
class WrappingButton : public QPushButton {
  Q_OBJECT
public:
  using QPushButton::QPushButton;

protected:
  void paintEvent(QPaintEvent *event) override;
};
