#pragma once

#include "data/Meldungen.h"

#include <QString>
#include <QStringList>

#include <deque>
#include <vector>

// Records every message box and answers from a script. Without a scripted answer a box is
// answered with its first button (OK or Ja).
class TestMeldungen : public Meldungen
{
public:
    struct Eintrag {
        QString text;
        Knoepfe knoepfe;
        Symbol symbol;
        QString titel;
    };

    Antwort zeige(const QString &text, Knoepfe knoepfe, Symbol symbol, const QString &titel) override;

    void antworte(Antwort a) { m_antworten.push_back(a); }
    const std::vector<Eintrag> &gezeigt() const { return m_gezeigt; }
    QStringList titel() const;
    QStringList texte() const;
    void leeren() { m_gezeigt.clear(); m_antworten.clear(); }

private:
    std::deque<Antwort> m_antworten;
    std::vector<Eintrag> m_gezeigt;
};
