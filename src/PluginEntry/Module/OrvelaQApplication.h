#pragma once

#include <QApplication>

/// The module's own application object, inside a host that has none.
class OrvelaQApplication final : public QApplication {
public:
    OrvelaQApplication(int& argc, char** argv) : QApplication(argc, argv) {}
    ~OrvelaQApplication() override = default;

    /// No exception of an event handler goes on into the toolkit: it is logged, and the event counts as not
    /// handled.
    bool notify(QObject* receiver, QEvent* event) override;
};
