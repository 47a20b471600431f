#pragma once

#include <QDialog>

class QCheckBox;

namespace orvela {

/// Tells of a version, with the choice not to be told of it again. Without a title and a parent of its own.
class UpdateMessage final : public QDialog {
    Q_OBJECT

public:
    explicit UpdateMessage(const QString& text);

    /// The choice.
    const QCheckBox* doNotShow() const { return mDoNotShow; }

private:
    QCheckBox* mDoNotShow;
};

} // namespace orvela
