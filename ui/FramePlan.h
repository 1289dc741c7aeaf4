#pragma once

#include <QGroupBox>

class Meldungen;
class Hauptfenster;
class PlanGenerator;
class Uhr;
class QLabel;
class QLineEdit;
class QPushButton;

// The panel "Plan erstellen": two dates, "Erstellen", "Abbrechen" and the progress caption.
class FramePlan : public QGroupBox
{
    Q_OBJECT
public:
    FramePlan(Meldungen &meldungen, Hauptfenster &hauptfenster, PlanGenerator &generator, const Uhr &uhr,
              QWidget *parent = nullptr);

    // Menu "&Plan erstellen ...".
    void MnuPlanErstellen_Click();

    // The designed size, so the page keeps its arrangement wherever there is room for it.
    QSize sizeHint() const override;

private:
    void TxtDatum_Change();
    void BtnErstellen_Click();
    void BtnAbbruch3_Click();
    void ZeigeFortschritt(int prozent);

    Meldungen &m_meldungen;
    Hauptfenster &m_hauptfenster;
    PlanGenerator &m_generator;
    const Uhr &m_uhr;

    QLineEdit *m_txtStartDatum = nullptr;
    QLineEdit *m_txtEndDatum = nullptr;
    QPushButton *m_btnErstellen = nullptr;
    QPushButton *m_btnAbbruch3 = nullptr;
    QLabel *m_panelPlanAnzeige = nullptr;
};
