#pragma once
#include <QProxyStyle>

/// A style, the desktop's, with its palette made legible: every text that is not
/// disabled has a contrast of at least 4.5 to its background. The focus of lists
/// and menu bars is seen, and controls lower or narrower than the desktop would have
/// them are drawn whole. Install it for the application.
class LegibleStyle : public QProxyStyle {
    Q_OBJECT

  public:
    using QProxyStyle::QProxyStyle;  ///< of the style that it adds to, which it owns from then on
    void polish(QPalette& palette) override;
    using QProxyStyle::polish;
    void drawControl(ControlElement element, const QStyleOption* option, QPainter* painter,
                     const QWidget* widget) const override;
    void drawComplexControl(ComplexControl control, const QStyleOptionComplex* option,
                            QPainter* painter, const QWidget* widget) const override;
    void drawPrimitive(PrimitiveElement element, const QStyleOption* option, QPainter* painter,
                       const QWidget* widget) const override;
    QRect subControlRect(ComplexControl control, const QStyleOptionComplex* option, SubControl part,
                         const QWidget* widget) const override;
};
