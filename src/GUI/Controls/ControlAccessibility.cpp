#include "GUI/Controls/ControlAccessibility.h"

#include "GUI/Controls/CColorPicker.h"
#include "GUI/Controls/CColorPickerPopup.h"
#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "GUI/Controls/COrvelaStatusIndicator.h"

#include <QAccessibleWidget>
#include <QDoubleValidator>

#include <algorithm>

namespace orvela {

namespace {

// A slider: its value and range are those of the number shown beside it.
class SliderAccess : public QAccessibleWidget, public QAccessibleValueInterface {
public:
    explicit SliderAccess(CThinHorizontalSlider* slider)
        : QAccessibleWidget(slider, QAccessible::Slider), mSlider(slider),
          mBlock(qobject_cast<COrvelaSliderBlockImpl*>(slider->parentWidget())) {}

    void* interface_cast(QAccessible::InterfaceType type) override {
        return type == QAccessible::ValueInterface && mBlock ? static_cast<QAccessibleValueInterface*>(this)
                                                             : QAccessibleWidget::interface_cast(type);
    }
    QString text(QAccessible::Text kind) const override {
        return kind == QAccessible::Value && mBlock ? mBlock->txtValue->text()
                                                    : QAccessibleWidget::text(kind);
    }
    QVariant currentValue() const override { return mBlock->txtValue->text().toDouble(); }
    void setCurrentValue(const QVariant& value) override {
        if (mSlider->isEnabled())
            mBlock->setVirtualValue(std::clamp(value.toDouble(), range()->bottom(), range()->top()));
    }
    QVariant minimumValue() const override { return range()->bottom(); }
    QVariant maximumValue() const override { return range()->top(); }
    QVariant minimumStepSize() const override {
        constexpr double kShown = 0.1; // one decimal
        return std::max((range()->top() - range()->bottom()) / 100, kShown);
    }

private:
    const QDoubleValidator* range() const {
        return qobject_cast<const QDoubleValidator*>(mBlock->txtValue->validator());
    }

    CThinHorizontalSlider* mSlider;
    COrvelaSliderBlockImpl* mBlock; ///< null for a slider on its own, which has no number
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

// The toolkit may outlive the module that this is part of.
void installControlAccessibility() {
    struct Factory {
        Factory() { QAccessible::installFactory(makeAccess); }
        ~Factory() { QAccessible::removeFactory(makeAccess); }
    };
    static const Factory factory;
}

} // namespace orvela
