// Stands in for the user of the windows that a module opens in a host which knows nothing of them, and for
// the part of a host that uses the same toolkit. The host loads it and adds steps, which are done one after
// the other as soon as they can be:
//     press NAME          clicks the button of that object name, or text, in the window that takes input
//     aim NAME            moves the system's pointer onto it and clicks there
//     box BUTTON          prints the message box and clicks its button
//     enter NAME TEXT     writes into the field of that object name in place of what it holds
//     key KEYS            into what has the focus
//     close               closes the window by its frame
//     throw               lets an exception out of an event handler
//     grab FILE           a picture of the window
//     watch               from now on prints each kind of window that is shown
// A step that cannot be done in time ends the process with status 3.

#include <QAbstractButton>
#include <QApplication>
#include <QElapsedTimer>
#include <QKeySequence>
#include <QLineEdit>
#include <QMessageBox>
#include <QProcess>
#include <QStringList>
#include <QTest>
#include <QTimer>
#include <QTranslator>

#include <unistd.h>

#include <clocale>
#include <cstdio>
#include <functional>
#include <memory>
#include <optional>
#include <stdexcept>
#include <string_view>

namespace {

constexpr int kTimeLimit = 60000; // milliseconds for a step
constexpr int kInterval = 5;
constexpr int kAim = 500; // milliseconds until a click of the pointer that hit nothing is tried again

void say(const QString& text) {
    std::puts(qUtf8Printable(text));
    std::fflush(stdout);
}

QString onOneLine(QString text) {
    return text.replace(QLatin1Char('\n'), QLatin1Char('/'));
}

QString nameOf(const QObject& window) {
    return window.objectName().isEmpty() ? QLatin1String(window.metaObject()->className())
                                         : window.objectName();
}

QString textOf(const QAbstractButton& button) {
    return button.text().remove(QLatin1Char('&'));
}

QWidget* window() {
    QWidget* modal = QApplication::activeModalWidget();
    return modal && modal->isVisible() ? modal : nullptr;
}

QAbstractButton* buttonOf(const QWidget& window, const QString& name) {
    for (QAbstractButton* button : window.findChildren<QAbstractButton*>())
        if ((button->objectName() == name || textOf(*button) == name) && button->isVisible() &&
            button->isEnabled())
            return button;
    return nullptr;
}

void printBox(const QMessageBox& box) {
    static const QStringList icons = {QStringLiteral("none"), QStringLiteral("information"),
                                      QStringLiteral("warning"), QStringLiteral("critical"),
                                      QStringLiteral("question")};
    QStringList buttons;
    for (const QAbstractButton* button : box.buttons())
        buttons += textOf(*button);
    say(QStringLiteral("box: ") + QStringList{box.windowTitle(), onOneLine(box.text()), icons.at(box.icon()),
                                              buttons.join(QLatin1Char(','))}
                                      .join(QLatin1Char('|')));
}

void aim(const QWidget& target) {
    const QPoint at = target.mapToGlobal(target.rect().center());
    QProcess::startDetached(QStringLiteral("xdotool"),
                            {QStringLiteral("mousemove"), QString::number(at.x()), QString::number(at.y()),
                             QStringLiteral("click"), QStringLiteral("1")});
}

class Thrower : public QObject {
    bool event(QEvent*) override { throw std::runtime_error("of a handler"); }
};

// What a step does, once it can be done.
using Act = std::function<void()>;

Act entering(const QWidget& window, const QString& argument) {
    for (auto* field : window.findChildren<QLineEdit*>(argument.section(QLatin1Char(' '), 0, 0)))
        if (field->isVisible() && field->isEnabled())
            return [=] {
                QTest::mouseClick(field, Qt::LeftButton);
                field->selectAll();
                QTest::keyClicks(field, argument.section(QLatin1Char(' '), 1));
                QTest::keyClick(field, Qt::Key_Return);
            };
    return {};
}

Act actionOf(const QString& verb, const QString& argument) {
    QWidget* shown = window();
    if (!shown)
        return {};
    auto* box = qobject_cast<QMessageBox*>(shown);
    QAbstractButton* button = buttonOf(*shown, argument);
    if (verb == QLatin1String("box") && box && button)
        return [=] {
            printBox(*box);
            button->click();
        };
    if (verb == QLatin1String("press") && !box && button)
        return [=] { QTest::mouseClick(button, Qt::LeftButton); };
    if (verb == QLatin1String("enter"))
        return entering(*shown, argument);
    if (verb == QLatin1String("key") && shown->isEnabled())
        return [=] {
            QWidget* focus = QApplication::focusWidget();
            QTest::keySequence(focus ? focus : shown, QKeySequence(argument));
        };
    if (verb == QLatin1String("close") && shown->isEnabled())
        return [=] { shown->close(); };
    if (verb == QLatin1String("throw"))
        return [] {
            Thrower thrower;
            QEvent event(QEvent::User);
            say(QStringLiteral("thrown, %1").arg(QCoreApplication::sendEvent(&thrower, &event)));
        };
    if (verb == QLatin1String("grab"))
        return [=] { say(shown->grab().save(argument) ? "grabbed" : "WRONG: no picture"); };
    return {};
}

class Watch : public QObject {
    bool eventFilter(QObject* watched, QEvent* event) override {
        const auto* widget = event->type() == QEvent::Show ? qobject_cast<QWidget*>(watched) : nullptr;
        if (widget && widget->isWindow() && !mSeen.contains(nameOf(*widget))) {
            mSeen += nameOf(*widget);
            say(QStringLiteral("shown: ") + mSeen.last());
        }
        return false;
    }
    QStringList mSeen;
};

class Clicker {
public:
    void add(const QString& step) {
        if (!QCoreApplication::instance())
            return say(QStringLiteral("WRONG: no application for ") + step);
        if (step == QLatin1String("watch")) {
            mWatch = std::make_unique<Watch>();
            return qApp->installEventFilter(mWatch.get());
        }
        mSteps += step;
        if (mTimer)
            return;
        mTimer = std::make_unique<QTimer>();
        mTimer->setSingleShot(true);
        QObject::connect(mTimer.get(), &QTimer::timeout, [this] { tick(); });
        mTimer->start(kInterval);
        mWaiting.start();
    }

    // The user's hands are off: steps that were not done are of no use any more.
    void rest() {
        for (const QString& step : std::exchange(mSteps, {}))
            say(QStringLiteral("WRONG: nobody asked for ") + step);
        mTimer.reset();
        mWatch.reset();
    }

private:
    // What it does may open a window, whose event loop needs the timer again before the click is over.
    void tick() {
        mTimer->start(kInterval);
        if (mSteps.isEmpty())
            return giveUpInTime();
        const QString verb = mSteps.first().section(QLatin1Char(' '), 0, 0);
        const QString argument = mSteps.first().section(QLatin1Char(' '), 1);
        if (verb == QLatin1String("aim"))
            return takeAim(argument);
        const Act act = actionOf(verb, argument);
        if (!act)
            return giveUpInTime();
        mSteps.removeFirst();
        mWaiting.start();
        act();
    }

    // The window may still be on its way to its place: then the pointer misses it, and tries again.
    void takeAim(const QString& name) {
        QAbstractButton* button = window() ? buttonOf(*window(), name) : nullptr;
        if (button && (!mAim.isValid() || mAim.elapsed() > kAim)) {
            mAim.start();
            QObject::disconnect(mHit);
            mHit = QObject::connect(button, &QAbstractButton::pressed, [this] {
                QObject::disconnect(mHit);
                mAim.invalidate();
                mSteps.removeFirst();
                mWaiting.start();
            });
            aim(*button);
        }
        giveUpInTime();
    }

    void giveUpInTime() {
        if (mWaiting.elapsed() < kTimeLimit)
            return;
        say(QStringLiteral("WRONG: cannot ") + mSteps.value(0, QStringLiteral("end without a step")));
        for (const QWidget* widget : QApplication::topLevelWidgets())
            say(QStringLiteral("window %1 \"%2\"%3")
                    .arg(nameOf(*widget), widget->windowTitle(),
                         QLatin1String(widget->isVisible() ? "" : " hidden")));
        if (const auto* box = qobject_cast<QMessageBox*>(window()))
            printBox(*box);
        ::_exit(3);
    }

    QStringList mSteps;
    QElapsedTimer mWaiting;
    QElapsedTimer mAim;
    QMetaObject::Connection mHit;
    std::unique_ptr<QTimer> mTimer;
    std::unique_ptr<Watch> mWatch;
};

Clicker& clicker() {
    static Clicker one;
    return one;
}

// A host that uses the toolkit itself, with all that a guest could change of it.
class Host {
public:
    Host() : mApplication(mCount, nullptr) {
        QCoreApplication::setOrganizationName(QStringLiteral("Host Makers"));
        QCoreApplication::setOrganizationDomain(QStringLiteral("host.example"));
        QCoreApplication::setApplicationName(QStringLiteral("Host"));
        qInstallMessageHandler(hear);
        QCoreApplication::installTranslator(&mTranslator);
        std::setlocale(LC_ALL, "C");
        mApplication.setStyleSheet(QStringLiteral("QLabel { color: red }"));
        QObject::connect(&mApplication, &QCoreApplication::aboutToQuit,
                         [] { say(QStringLiteral("WRONG: quit")); });
    }
    ~Host() { qInstallMessageHandler(nullptr); }
    Host(const Host&) = delete;
    Host& operator=(const Host&) = delete;

    void tell() {
        QCoreApplication::sendPostedEvents();
        QCoreApplication::processEvents();
        say(QStringList{QStringLiteral("host"), QCoreApplication::organizationName(),
                        QCoreApplication::organizationDomain(), QCoreApplication::applicationName(),
                        QLatin1String(std::setlocale(LC_ALL, nullptr)), mApplication.styleSheet(),
                        QCoreApplication::translate("CDlgMain", "Automatic"),
                        QString::number(QApplication::topLevelWidgets().size())}
                .join(QLatin1Char('|')));
        qWarning("the host's own");
    }

private:
    class Translator : public QTranslator {
        bool isEmpty() const override { return false; }
        QString translate(const char*, const char* text, const char*, int) const override {
            return QStringLiteral("the host's ") + QLatin1String(text);
        }
    };

    static void hear(QtMsgType, const QMessageLogContext&, const QString& text) {
        say(QStringLiteral("the host hears ") + text);
    }

    int mCount = 0;
    QApplication mApplication;
    Translator mTranslator;
};

std::optional<Host> gHost;

} // namespace

extern "C" {
[[gnu::visibility("default")]] void clicker_add(const char* step) {
    clicker().add(QString::fromUtf8(step));
}

[[gnu::visibility("default")]] void clicker_rest() {
    clicker().rest();
}

// begin, tell or end.
[[gnu::visibility("default")]] void clicker_host(const char* word) {
    if (word == std::string_view("begin"))
        gHost.emplace();
    else if (word == std::string_view("tell") && gHost)
        gHost->tell();
    else
        gHost.reset();
}
}
