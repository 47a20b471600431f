// The picture that a user accepts in the windows is the one that the command makes of the same settings.

#include "GUI/Controls/CColorPicker.h"
#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "GUI/Windows/CDlgSettingsImpl.h"
#include "PluginEntry/Exchange/PictureSession.h"
#include "Settings/ModeTable.h"
#include "Settings/PaneTable.h"
#include "Settings/SettingsStore.h"
#include "files/PhotographReader.h"
#include "files/PhotographWriter.h"
#include "hosts/command/ProgramRun.h"
#include "support/HostedPicture.h"
#include "support/ModalDialog.h"

#include <QAbstractButton>
#include <QComboBox>
#include <QInputDialog>
#include <QLineEdit>
#include <QMessageBox>
#include <QTest>
#include <QTimer>

using namespace orvela;

namespace {

class AcceptedPicture : public ProgramTest {
protected:
    AcceptedPicture() {
        setSettingsApplication(QStringLiteral("Orvela")); // the command's
        sample("a.png");
    }
    ~AcceptedPicture() override { openSettings().clear(); }

    // What the windows write when the user has done that and clicks on OK.
    QByteArray accepted(EGUIMode mode, const std::function<void()>& user) {
        HostedPicture host(readPhotograph(path("a.png").toStdString()));
        std::int16_t result = 0;
        PictureSession session(&host.record(), &result);
        CDlgSettingsImpl window(mode, &session.input(), &session.output());
        mWindow = &window;
        QTimer::singleShot(0, &window, [&] {
            QTest::qWait(1); // the window restores its state first
            user();
            click("btnOK");
        });
        window.run();
        EXPECT_TRUE(window.appliesOnFinish());
        session.writeBack();
        WriteOptions options;
        options.overwrite = true;
        writePhotograph(host.result, path("windows.png").toStdString(), options);
        return bytes("windows.png");
    }

    QByteArray commanded(const QString& arguments) {
        const QString line = QStringLiteral("enhance a.png -o command.png --force ") + arguments;
        const Answer answer = orvela(line.toUtf8());
        EXPECT_EQ(answer.status, 0) << answer.err;
        return bytes("command.png");
    }

    void click(const char* button) {
        QTest::mouseClick(mWindow->findChild<QAbstractButton*>(QLatin1String(button)), Qt::LeftButton);
    }

    // Switches the slider on and types the number.
    void type(const char* object, const QString& number) {
        auto* block = mWindow->findChild<COrvelaSliderBlockImpl*>(QLatin1String(object));
        if (!block->isEnabled())
            QTest::keyClick(block->lmpState, Qt::Key_Space);
        type(block->txtValue, number);
    }
    static void type(QLineEdit* field, const QString& text) {
        field->setFocus();
        field->selectAll();
        QTest::keyClicks(field, text);
        QTest::keyClick(field, Qt::Key_Return);
    }

    // A number of the slider's own range, as its field shows numbers.
    static QString numberOf(const PaneSlider& slider, double share) {
        const double low = slider.slider.scale->low();
        const double number = low + share * (slider.slider.scale->high() - low);
        return QString::number(number, 'f', 1);
    }

    CDlgSettingsImpl* mWindow = nullptr;
};

} // namespace

TEST_F(AcceptedPicture, IsThatOfTheCommandForEverySingleFilter) {
    const QByteArray original = commanded(QStringLiteral("--mode Saturation --value 5")); // changes nothing
    int compared = 0;
    for (const ModeDescription& mode : ModeTable::all()) {
        const PaneSlider* slider = PaneTable::single(mode.mode);
        if (!slider)
            continue;
        SCOPED_TRACE(mode.displayName);
        const QString number = numberOf(*slider, 0.7);
        const bool colored = !PaneTable::colors(mode.mode).empty();
        const QByteArray picture = accepted(mode.mode, [&] {
            type(slider->object, number);
            if (!colored)
                return;
            const auto fields = mWindow->findChild<CColorPicker*>()->findChildren<QLineEdit*>();
            for (qsizetype i = 0; i < 3; ++i)
                type(fields[i], QStringList{"200", "40", "10"}[i]);
        });
        const QString name =
            QLatin1String(mode.mode == Mode_AutoColorFilter ? "AutoColorFilter" : mode.displayName);
        const QString color = colored ? QStringLiteral(" --colour 200,40,10") : QString();
        EXPECT_TRUE(picture ==
                    commanded(QStringLiteral("--mode \"%1\" --value=%2%3").arg(name, number, color)));
        compared += picture != original;
    }
    EXPECT_EQ(compared, 12); // two find nothing to do in this picture
}

TEST_F(AcceptedPicture, IsThatOfTheCommandForThreeSliders) {
    const std::pair<EGUIMode, QStringList> modes[] = {
        {Mode_SmartLevels, {"highlights", "middle", "dark"}},
        {Mode_Adjustments, {"saturation", "highlights", "dark"}}};
    for (const auto& [mode, options] : modes) {
        SCOPED_TRACE(ModeTable::find(mode)->displayName);
        const auto sliders = PaneTable::threeSliders(mode);
        QString arguments = QStringLiteral("--mode \"%1\"").arg(ModeTable::find(mode)->displayName);
        for (std::size_t i = 0; i < sliders.size(); ++i)
            arguments += QStringLiteral(" --%1 %2").arg(options[i], numberOf(sliders[i], 0.3));
        EXPECT_TRUE(commanded(arguments) == accepted(mode, [&sliders = sliders, this] {
                        for (const PaneSlider& slider : sliders)
                            type(slider.object, numberOf(slider, 0.3));
                    }));
    }
}

TEST_F(AcceptedPicture, IsThatOfTheCommandForAPresetSavedInAdvancedAndAFinalTouch) {
    const auto tune = [this] {
        mWindow->findChild<QComboBox*>(QStringLiteral("lstBxPreset"))->setCurrentText("PortraitPro");
        type("sldrDigitalFlash", QStringLiteral("33.3"));
        type("sldrSaturation", QStringLiteral("6.1"));
        type("sldrFade", QStringLiteral("20.7"));
        const ModalDialogs answer([this](QDialog& dialog) {
            if (auto* name = qobject_cast<QInputDialog*>(&dialog)) {
                name->setTextValue(QStringLiteral("of mine"));
                name->accept();
            } else if (auto* box = qobject_cast<QMessageBox*>(&dialog)) { // to overwrite it
                box->button(QMessageBox::Yes)->click();
            }
        });
        click("btnSavePreset");
    };
    const QByteArray tuned = accepted(Mode_Advanced, tune);
    EXPECT_TRUE(tuned == commanded(QStringLiteral("--preset \"of mine\"")));
    const QByteArray touched = accepted(Mode_Advanced, [&] {
        tune();
        click("btnRefresh");
        click("btnFinalTouch");
        type("sldrPercContrast", QStringLiteral("30"));
        type("sldrPercShadowsRGB", QStringLiteral("20"));
        type("sldrAbsColorFilter", QStringLiteral("10")); // white, as its picker starts
    });
    EXPECT_TRUE(touched == commanded(QStringLiteral("--preset \"of mine\" --final-touch "
                                                    "PercContrast=30,PercShadowsRGB=20,AbsColorFilter=10")));
    EXPECT_FALSE(touched == tuned);
}
