#include "platform/qt/style.h"

#include <QAbstractItemView>
#include <QPainter>
#include <cstdlib>

#include "platform/qt/list_model.h"

namespace onramp::qt {

namespace {

constexpr int kRingWidth = 2;
constexpr qreal kCornerRadius = 3;
constexpr int kRoomBesideTitle = 10;
constexpr int kRoomAboveTitle = 3;
constexpr int kLeastGrayDistance = 150;  ///< between a title and its button, in grey levels
constexpr int kLeastDisabledDistance = 40;

void drawRing(QPainter& painter, const QRect& around, const QColor& color) {
  painter.save();
  painter.setRenderHint(QPainter::Antialiasing);
  painter.setPen(QPen(color, kRingWidth));
  painter.setBrush(Qt::NoBrush);
  constexpr qreal kInset = kRingWidth / 2.0;
  painter.drawRoundedRect(QRectF(around).adjusted(kInset, kInset, -kInset, -kInset), kCornerRadius,
                          kCornerRadius);
  painter.restore();
}

// Returns the colour for the default button: the colour of selections. If the button's title is not
// darker than this colour, darkens the colour until the title can be read.
QColor defaultButtonColor(const QPalette& palette) {
  QColor color = palette.color(QPalette::Highlight);
  const int title = qGray(palette.color(QPalette::HighlightedText).rgb());
  if (title < qGray(color.rgb())) return color;
  while (qGray(color.rgb()) > 0 && title - qGray(color.rgb()) < kLeastGrayDistance) {
    color = color.darker(110);
  }
  return color;
}

void drawDefaultFace(QPainter& painter, const QStyleOptionButton& button) {
  QColor color = defaultButtonColor(button.palette);
  if (button.state & QStyle::State_Sunken) color = color.darker(125);
  painter.save();
  painter.setRenderHint(QPainter::Antialiasing);
  painter.setPen(color.darker(120));
  painter.setBrush(color);
  painter.drawRoundedRect(QRectF(button.rect).adjusted(0.5, 0.5, -0.5, -0.5), kCornerRadius,
                          kCornerRadius);
  painter.restore();
}

// Draws the outline of a radio button. Fusion's own outline is invisible on dark colours.
void drawOutline(QPainter& painter, const QStyleOption& radioButton) {
  painter.save();
  painter.setRenderHint(QPainter::Antialiasing);
  QColor color = radioButton.palette.color(QPalette::WindowText);
  color.setAlphaF(0.6F);
  painter.setPen(color);
  painter.setBrush(Qt::NoBrush);
  painter.drawEllipse(QRectF(radioButton.rect).adjusted(1, 1, -1, -1));
  painter.restore();
}

bool isList(const QWidget* widget) {
  return qobject_cast<const QAbstractItemView*>(widget) != nullptr;
}

}  // namespace

Style::Style() : QProxyStyle(QStringLiteral("Fusion")) {}

void Style::drawControl(ControlElement element, const QStyleOption* option, QPainter* painter,
                        const QWidget* widget) const {
  const auto* const button = qstyleoption_cast<const QStyleOptionButton*>(option);
  if (element == CE_PushButton && button) {
    drawPushButton(*button, *painter, widget);
    return;
  }
  QProxyStyle::drawControl(element, option, painter, widget);
  if (element == CE_ShapedFrame && isList(widget) && (option->state & State_HasFocus)) {
    drawRing(*painter, option->rect, option->palette.color(QPalette::Highlight));
  }
}

void Style::drawPushButton(const QStyleOptionButton& button, QPainter& painter,
                           const QWidget* widget) const {
  QStyleOptionButton face(button);
  const bool isDefault =
      (button.features & QStyleOptionButton::DefaultButton) && (button.state & State_Enabled);
  face.features.setFlag(QStyleOptionButton::DefaultButton, false);
  face.state.setFlag(State_HasFocus, false);
  if (isDefault) {
    drawDefaultFace(painter, face);
    face.palette.setBrush(QPalette::ButtonText, button.palette.highlightedText());
    face.rect = subElementRect(SE_PushButtonContents, &button, widget);
    QProxyStyle::drawControl(CE_PushButtonLabel, &face, &painter, widget);
  } else {
    QProxyStyle::drawControl(CE_PushButton, &face, &painter, widget);
  }
  if (!(button.state & State_HasFocus)) return;
  if (isDefault) {
    constexpr int kInset = kRingWidth + 1;
    drawRing(painter, button.rect.adjusted(kInset, kInset, -kInset, -kInset),
             button.palette.color(QPalette::HighlightedText));
  } else {
    drawRing(painter, button.rect, button.palette.color(QPalette::Highlight));
  }
}

void Style::drawPrimitive(PrimitiveElement element, const QStyleOption* option, QPainter* painter,
                          const QWidget* widget) const {
  if (element != PE_FrameFocusRect) {
    QProxyStyle::drawPrimitive(element, option, painter, widget);
    if (element == PE_IndicatorRadioButton) drawOutline(*painter, *option);
  } else if (!isList(widget)) {  // drawControl() draws a focused list's ring, around all rows
    drawRing(*painter, option->rect, option->palette.color(QPalette::Highlight));
  }
}

// Makes disabled text readable. In some high-contrast palettes, this text has the colour of the
// window.
void Style::drawItemText(QPainter* painter, const QRect& rectangle, int flags,
                         const QPalette& palette, bool isEnabled, const QString& text,
                         QPalette::ColorRole role) const {
  QPalette readable(palette);
  const int window = qGray(palette.color(QPalette::Window).rgb());
  if (!isEnabled && role != QPalette::NoRole &&
      std::abs(qGray(palette.color(role).rgb()) - window) < kLeastDisabledDistance) {
    QColor color = palette.color(QPalette::Active, role);
    color.setAlphaF(0.6F);
    readable.setColor(palette.currentColorGroup(), role, color);
  }
  QProxyStyle::drawItemText(painter, rectangle, flags, readable, isEnabled, text, role);
}

int Style::pixelMetric(PixelMetric metric, const QStyleOption* option,
                       const QWidget* widget) const {
  if (metric == PM_DefaultFrameWidth && isList(widget)) return kRingWidth;
  return QProxyStyle::pixelMetric(metric, option, widget);
}

QSize Style::sizeFromContents(ContentsType type, const QStyleOption* option, const QSize& size,
                              const QWidget* widget) const {
  const QSize normal = QProxyStyle::sizeFromContents(type, option, size, widget);
  // Rows that are a little taller than their text are easier to read and to click.
  if (type == CT_ItemViewItem) return normal.expandedTo(QSize(0, ListModel::rowHeight()));
  // In front of the text, Fusion reserves a column that is as wide as the item is high, for check
  // marks. If the text is large, the width that Fusion computes leaves no room for this column.
  if (type == CT_MenuItem) return normal + QSize(normal.height(), 0);
  if (type != CT_PushButton) return normal;
  return normal + QSize(2 * kRoomBesideTitle, 2 * kRoomAboveTitle);
}

}  // namespace onramp::qt
