#include "GUI/Controls/ControlAccessibility.h"

#include "GUI/Controls/CColorPicker.h"
#include "GUI/Controls/CColorPickerPopup.h"
#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "GUI/Controls/COrvelaStatusIndicator.h"

#include <QAccessibleWidget>

namespace orvela {

namespace {

// A slider: its value is the number shown beside it, its range that of the positions.
class SliderAccess : public QAccessibleWidget, public QAccessibleValueInterface {
public:
    explicit SliderAccess(CThinHorizontalSlider* slider)
        : QAccessibleWidget(slider, QAccessible::Slider), mSlider(slider) {}

    void* interface_cast(QAccessible::InterfaceType type) override {
        return type == QAccessible::ValueInterface ? static_cast<QAccessibleValueInterface*>(this)
                                                   : QAccessibleWidget::interface_cast(type);
    }
    QString text(QAccessible::Text kind) const override {
        const auto* block = qobject_cast<COrvelaSliderBlockImpl*>(mSlider->parentWidget());
        return kind == QAccessible::Value && block ? block->txtValue->text() : QAccessibleWidget::text(kind);
    }
    QVariant currentValue() const override { return mSlider->value(); }
    void setCurrentValue(const QVariant& value) override {
        if (mSlider->isEnabled())
            mSlider->moveTo(value.toDouble());
    }
    QVariant minimumValue() const override { return mSlider->minimum(); }
    QVariant maximumValue() const override { return mSlider->maximum(); }
    QVariant minimumStepSize() const override { return {}; }

private:
    CThinHorizontalSlider* mSlider;
};

// The progress display: the percentage is its value, the step its description.
class ProgressAccess : public QAccessibleWidget, public QAccessibleValueInterface {
public:
    explicit ProgressAccess(COrvelaStatusIndicator* indicator)
        : QAccessibleWidget(indicator, QAccessible::ProgressBar), mIndicator(indicator) {}

    void* interface_cast(QAccessible::InterfaceType type) override {
        return type == QAccessible::ValueInterface ? static_cast<QAccessibleValueInterface*>(this)
                                                   : QAccessibleWidget::interface_cast(type);
    }
    QString text(QAccessible::Text kind) const override {
        return kind == QAccessible::Description ? mIndicator->stepName() : QAccessibleWidget::text(kind);
    }
    QVariant currentValue() const override { return mIndicator->percentage(); }
    void setCurrentValue(const QVariant&) override {}
    QVariant minimumValue() const override { return 0; }
    QVariant maximumValue() const override { return 100; }
    QVariant minimumStepSize() const override { return 1; }

private:
    COrvelaStatusIndicator* mIndicator;
};

class PickerAccess : public QAccessibleWidget {
public:
    explicit PickerAccess(CColorPicker* picker)
        : QAccessibleWidget(picker, QAccessible::ColorChooser), mPicker(picker) {}

    QString text(QAccessible::Text kind) const override {
        return kind == QAccessible::Value ? mPicker->color().name() : QAccessibleWidget::text(kind);
    }

private:
    CColorPicker* mPicker;
};

QAccessibleInterface* makeAccess(const QString&, QObject* object) {
    if (auto* slider = qobject_cast<CThinHorizontalSlider*>(object))
        return new SliderAccess(slider);
    if (auto* indicator = qobject_cast<COrvelaStatusIndicator*>(object))
        return new ProgressAccess(indicator);
    if (auto* picker = qobject_cast<CColorPicker*>(object))
        return new PickerAccess(picker);
    if (auto* popup = qobject_cast<CColorPickerPopup*>(object))
        return new QAccessibleWidget(popup, QAccessible::ColorChooser);
    if (auto* block = qobject_cast<COrvelaSliderBlockImpl*>(object))
        return new QAccessibleWidget(block, QAccessible::Grouping);
    return nullptr;
}

} // namespace

void installControlAccessibility() {
    static const bool installed = (QAccessible::installFactory(makeAccess), true);
    static_cast<void>(installed);
}

} // namespace orvela
