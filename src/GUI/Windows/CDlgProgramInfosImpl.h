#pragma once

#include "GUI/forms/ui_CDlgProgramInfos.h"

#include <QDialog>

/// What the program is, for which hosts, and what it is made with.
class CDlgProgramInfosImpl final : public QDialog, public Ui::CDlgProgramInfos {
    Q_OBJECT

public:
    explicit CDlgProgramInfosImpl(QWidget* parent);
};
