#pragma once

#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "GUI/Panes/IWgtPane.h"

#include <QAbstractButton>
#include <QColor>
#include <QVBoxLayout>

namespace orvela {

/// Stands in for the window of a pane and records what it is told.
class RecordingOwner : public QWidget {
    Q_OBJECT

public:
    QList<double> values;
    QList<bool> states;
    QList<QColor> colors;

public Q_SLOTS:
    void onMy_slider_valueChanged(double value) { values.append(value); }
    void onMy_slider_stateChanged(bool on) { states.append(on); }
    void onMy_colorPicker_colorChanged(QColor color) { colors.append(color); }
};

/// A pane of type P shown in its window.
template <class P>
struct Shown {
    explicit Shown(EGUIMode mode) : pane(new P(&owner, mode)) {
        auto* layout = new QVBoxLayout(&owner);
        layout->addWidget(pane);
        owner.show();
    }

    RecordingOwner owner;
    P* pane;
};

/// A slider and the names of the fields that it drives; empty where it has none.
struct Drives {
    std::string object;
    std::string value;
    std::string enabled;
};

COrvelaSliderBlockImpl* blockOf(const QWidget* pane, const std::string& object);

/// Puts every slider to a position and state of its own and expects applyGUIParams() to write exactly the
/// fields named by `sliders`, and `color` into the three fields that begin with `colorField`.
void expectWrites(IWgtPane* pane, const std::vector<Drives>& sliders, const std::string& colorField,
                  const QColor& color);

/// Expects the slider to show every position to one decimal and to keep it as exactly as that tells it.
void expectShowsEveryPosition(const QWidget* pane, const PaneSlider& slider);

/// How far the text's one decimal may move a slider from `position`.
double snapping(const SliderScale& scale, double position);

/// Expects a core of that class, and `button` to ask for `mode` unless the core's last run began and was not
/// completed.
void expectLeadsOn(IWgtPane* pane, QAbstractButton* button, const char* coreClass, EGUIMode mode);

/// "title|text" of every box shown while `action` runs.
QStringList boxes(const std::function<void()>& action);

} // namespace orvela
