#pragma once

#include <QWidget>

class QLabel;
class QLineEdit;
class QTimer;
class QToolBar;
class QTreeWidget;
class QTreeWidgetItem;

namespace orvela {

class HelpBrowser;

/// Shows the manual: its table of contents beside the page, with a search in the page. Belongs to the window
/// that it helps with and can be used while that one is modal; when a modal window with a help button of its
/// own opens it goes over to that one, and back when it closes. Remembers where it stood.
class HelpWindow : public QWidget {
    Q_OBJECT

public:
    explicit HelpWindow(QWidget* owner);

    /// Shows the page of a topic, the first one where the manual does not have it, for the window `owner`.
    void openTopic(const QString& topic, QWidget* owner);

protected:
    bool event(QEvent* event) override;
    bool eventFilter(QObject* watched, QEvent* event) override;
    void closeEvent(QCloseEvent* event) override;

private:
    void layOut();
    void fillBar(QToolBar& bar);
    void fillContents();
    void addShortcuts();
    void belongTo(QWidget* owner);
    void followModalWindow();
    void leaveOwner();
    void leaveSearch();
    void showEntry(const QTreeWidgetItem* entry);
    void markEntry(const QUrl& address);
    void searchFrom(int position, bool backwards);
    void searchOn(bool backwards);

    HelpBrowser* mPage;
    QTreeWidget* mContents;
    QLineEdit* mSearch;
    QLabel* mMissing; ///< says that the page does not have what is searched for
    QTimer* mFollow;  ///< runs out once a modal window stands
};

/// Opens a topic of the manual, such as "welcome.htm", for the window `owner`: the compiled manual in the
/// system's viewer where both are there, else the help window. Further calls use the same window. `owner` is
/// never null.
void openHelp(const QString& topic, QWidget* owner);

} // namespace orvela
