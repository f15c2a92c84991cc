#pragma once

#include <QProxyStyle>
#include <QStyleOption>

namespace onramp::qt {

/// Qt's style "Fusion" with some changes. Fusion draws the same outline around the default button
/// and the focused control. In this style, the default button has the colour of selections, and a
/// ring marks the focused control. Buttons, list rows and menu items get more room than in Fusion.
/// The outline of radio buttons is visible in dark colour schemes, and disabled text is readable in
/// high-contrast ones.
class Style final : public QProxyStyle {
  Q_OBJECT

 public:
  Style();

  void drawControl(ControlElement element, const QStyleOption* option, QPainter* painter,
                   const QWidget* widget) const override;
  void drawPrimitive(PrimitiveElement element, const QStyleOption* option, QPainter* painter,
                     const QWidget* widget) const override;
  void drawItemText(QPainter* painter, const QRect& rectangle, int flags, const QPalette& palette,
                    bool isEnabled, const QString& text, QPalette::ColorRole role) const override;
  int pixelMetric(PixelMetric metric, const QStyleOption* option,
                  const QWidget* widget) const override;
  QSize sizeFromContents(ContentsType type, const QStyleOption* option, const QSize& size,
                         const QWidget* widget) const override;

 private:
  void drawPushButton(const QStyleOptionButton& button, QPainter& painter,
                      const QWidget* widget) const;
};

}  // namespace onramp::qt
