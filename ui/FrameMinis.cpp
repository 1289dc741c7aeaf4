#include "ui/FrameMinis.h"

#include "data/InitMini.h"
#include "data/Meldungen.h"
#include "ui/Hauptfenster.h"

FrameMinis::FrameMinis(InitMini &daten, Meldungen &meldungen, Hauptfenster &hauptfenster, QWidget *parent)
    : QGroupBox(parent)
{
    (void)daten;
    (void)meldungen;
    (void)hauptfenster;
    setObjectName(QStringLiteral("FrameMinis"));
    hide();
}

void FrameMinis::MnuListe_Click()
{
}

void FrameMinis::DatenGeladen()
{
}
