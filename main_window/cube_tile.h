#pragma once
#include <QWidget>

/// One tile of the board. It keeps what was drawn on it. The property `selected`
/// tells its look, its accessible name the letter shown.
class CubeTile : public QWidget {
    Q_OBJECT

  public:
    explicit CubeTile(QWidget* parent);

    /// Shows a letter, "Qu" or nothing in one of the two looks, at once.
    void draw(bool selected, const QString& letter);

    /// The letter last drawn, empty at first.
    QString letter() const { return letter_; }
    bool isSelected() const { return selected_; }

  signals:
    /// The left button was released on the tile, and then pressed again within
    /// the double-click time. The release after a double click is not a click.
    void clicked();
    void doubleClicked();

  protected:
    void paintEvent(QPaintEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;

  private:
    void tellLit();

    bool selected_ = false;
    bool pressed_ = false;
    QString letter_;
};
