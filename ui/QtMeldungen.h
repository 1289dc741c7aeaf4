#pragma once

#include "data/Meldungen.h"

// Message boxes as QMessageBox with German button texts.
class QtMeldungen : public Meldungen
{
public:
    Antwort zeige(const QString &text, Knoepfe knoepfe, Symbol symbol, const QString &titel) override;
};
