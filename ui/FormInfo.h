#pragma once

#include <QDialog>
#include <QPointer>

class Hilfe;
class QPushButton;

// The start-up window and the window of "&Info". At program start (main window not yet
// visible) it names the help file and shows the main window. From the menu it is shown as a
// secondary window, which enables the main window again when it closes.
class FormInfo : public QDialog
{
    Q_OBJECT
public:
    FormInfo(QWidget &hauptfenster, Hilfe &hilfe, const QString &programmOrdner, QWidget *parent = nullptr);

protected:
    void closeEvent(QCloseEvent *event) override;
    void hideEvent(QHideEvent *event) override;

private:
    void FormUnload();

    QPointer<QWidget> m_haupt;
    QPushButton *m_cmdOK;
    bool m_entladen = false;
};
