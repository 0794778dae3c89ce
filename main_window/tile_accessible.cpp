#include "main_window/tile_accessible.h"

#include <QAccessibleWidget>

#include "main_window/cube_tile.h"

namespace {

// A check box, since readers say of no other control whether it is checked.
class TileAccessible : public QAccessibleWidget {
  public:
    explicit TileAccessible(CubeTile* tile) : QAccessibleWidget(tile, QAccessible::CheckBox) {}

    QAccessible::State state() const override {
        QAccessible::State state = QAccessibleWidget::state();
        state.checkable = true;
        state.checked = tile()->isSelected();
        return state;
    }

    QStringList actionNames() const override { return {pressAction()}; }

    void doAction(const QString& name) override {
        if (name == pressAction()) emit tile()->clicked();
    }

  private:
    CubeTile* tile() const { return static_cast<CubeTile*>(widget()); }
};

QAccessibleInterface* MakeInterface(const QString&, QObject* object) {
    auto* tile = qobject_cast<CubeTile*>(object);
    return tile == nullptr ? nullptr : new TileAccessible(tile);
}

}  // namespace

void MainWindow::MakeTilesAccessible() {
    QAccessible::installFactory(MakeInterface);
}
