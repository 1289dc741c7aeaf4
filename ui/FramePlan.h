#pragma once

#include <QGroupBox>

struct InitMini;
class Meldungen;
class Hauptfenster;
class PlanGenerator;
class Uhr;

// The panel "Plan erstellen": two dates, "Erstellen", "Abbrechen" and the progress caption.
class FramePlan : public QGroupBox
{
    Q_OBJECT
public:
    FramePlan(InitMini &daten, Meldungen &meldungen, Hauptfenster &hauptfenster, PlanGenerator &generator,
              const Uhr &uhr, QWidget *parent = nullptr);

    // Menu "&Plan erstellen ...".
    void MnuPlanErstellen_Click();
};
