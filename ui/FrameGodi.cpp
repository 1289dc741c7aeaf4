#include "ui/FrameGodi.h"

#include "data/InitMini.h"
#include "data/Meldungen.h"
#include "ui/Hauptfenster.h"

FrameGodi::FrameGodi(InitMini &daten, Meldungen &meldungen, Hauptfenster &hauptfenster, QWidget *parent)
    : QGroupBox(parent)
{
    (void)daten;
    (void)meldungen;
    (void)hauptfenster;
    setObjectName(QStringLiteral("FrameGodi"));
    hide();
}

void FrameGodi::MnuTermine_Click()
{
}

void FrameGodi::DatenGeladen()
{
}
