#include "platform/menu_bar.h"

#include <QVBoxLayout>

#include "platform/layout.h"

QMenuBar* Platform::MakeMenuBar(QWidget* window) {
    auto* bar = new QMenuBar(window);
    bar->setObjectName("MenuBar");
    bar->setNativeMenuBar(false);
    bar->setFont(PlainFont());
    return bar;
}

void Platform::FillBelow(QMenuBar* bar, QWidget* client) {
    auto* layout = new QVBoxLayout(bar->parentWidget());
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setMenuBar(bar);
    layout->addWidget(client);
}
