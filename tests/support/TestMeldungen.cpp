#include "support/TestMeldungen.h"

Antwort TestMeldungen::zeige(const QString &text, Knoepfe knoepfe, Symbol symbol, const QString &titel)
{
    m_gezeigt.push_back({text, knoepfe, symbol, titel});
    if (!m_antworten.empty()) {
        Antwort a = m_antworten.front();
        m_antworten.pop_front();
        return a;
    }
    return (knoepfe == Knoepfe::OK || knoepfe == Knoepfe::OKAbbrechen) ? Antwort::OK : Antwort::Ja;
}

QStringList TestMeldungen::titel() const
{
    QStringList l;
    for (const auto &e : m_gezeigt)
        l << e.titel;
    return l;
}

QStringList TestMeldungen::texte() const
{
    QStringList l;
    for (const auto &e : m_gezeigt)
        l << e.text;
    return l;
}
