#pragma once

#include <QDialog>

struct InitMini;
class Meldungen;
class QCheckBox;
class QLineEdit;
class QPushButton;
class QToolButton;

// "Einstellungen": the interval between two assignments of one server and the sibling rule.
// The text box and the check box are the working copy until "OK".
class FormEinstellungen : public QDialog
{
    Q_OBJECT
public:
    FormEinstellungen(InitMini &daten, Meldungen &meldungen, QWidget *parent = nullptr);

protected:
    void showEvent(QShowEvent *event) override;
    bool eventFilter(QObject *objekt, QEvent *event) override;

private:
    void FormActivate();
    void SpinBtnIntervall_SpinDown();
    void SpinBtnIntervall_SpinUp();
    void TxtIntervall_LostFocus();
    void BtnOKEinstellungen_Click();
    void BtnAbbruchEinstellungen_Click();
    void pruefeNachLoslassen();

    InitMini &m_daten;
    Meldungen &m_meldungen;
    QCheckBox *m_checkGeschwister;
    QLineEdit *m_txtIntervall;
    QToolButton *m_spinHoch;
    QToolButton *m_spinRunter;
    QPushButton *m_btnOK;
    QPushButton *m_btnAbbruch;
    bool m_aktiviert = false;
    // The text box had the focus and has not been checked since.
    bool m_pruefungOffen = false;
    bool m_wartetAufLoslassen = false;
};
