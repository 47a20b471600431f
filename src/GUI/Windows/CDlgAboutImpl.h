#pragma once

#include "GUI/forms/ui_CDlgAbout.h"

#include <QDialog>

/// The product and who made it.
class CDlgAboutImpl final : public QDialog, public Ui::CDlgAbout {
    Q_OBJECT

public:
    explicit CDlgAboutImpl(QWidget* parent);
};
