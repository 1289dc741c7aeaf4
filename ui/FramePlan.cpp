#include "ui/FramePlan.h"

#include "data/InitMini.h"
#include "data/Meldungen.h"
#include "data/Uhr.h"
#include "plan/PlanGenerator.h"
#include "ui/Hauptfenster.h"

FramePlan::FramePlan(InitMini &daten, Meldungen &meldungen, Hauptfenster &hauptfenster, PlanGenerator &generator,
                     const Uhr &uhr, QWidget *parent)
    : QGroupBox(parent)
{
    (void)daten;
    (void)meldungen;
    (void)hauptfenster;
    (void)generator;
    (void)uhr;
    setObjectName(QStringLiteral("FramePlan"));
    hide();
}

void FramePlan::MnuPlanErstellen_Click()
{
}
