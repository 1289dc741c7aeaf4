#pragma once

#include "output/Drucker.h"

#include <QString>
#include <QStringList>

#include <map>
#include <vector>

// A printer that logs every call and measures with exact numbers, so that layout tests can
// check positions and page breaks to the pixel:
//   width  = characters x size, times 1.5 in bold and 1.25 in italic
//   height = 2 x size (any text, the empty one included)
// Pages follow the contract of Drucker: a new page begins only when a non-empty text is drawn.
class AufzeichnenderDrucker : public Drucker
{
public:
    struct Aufruf {
        QString art;     // the operation, e.g. "drucke", "neueSeite", "setzeSchriftGroesse"
        QString text;
        double x = 0;    // position before a text is drawn
        double y = 0;
        double groesse = 0;
        bool fett = false;
        bool kursiv = false;
        int seite = 0;   // page of drawn text
    };

    AufzeichnenderDrucker(double breite = 1000, double hoehe = 2000) : m_breite(breite), m_hoehe(hoehe) {}

    // Printers and their fonts; by default one printer with two fonts.
    QStringList drucker{QStringLiteral("Drucker A")};
    std::map<QString, QStringList> schriften{{QStringLiteral("Drucker A"), {QStringLiteral("Arial"), QStringLiteral("Times")}}};

    // Throws DruckerFehler at the n-th (1-based) call of the operation named art.
    void scheitereBei(const QString &art, int n, DruckerFehler::Art fehlerArt = DruckerFehler::Art::Dienst)
    {
        m_fehlerArt = art;
        m_fehlerNach = n;
        m_fehlerTyp = fehlerArt;
    }

    int druckerAnzahl() const override { return drucker.size(); }
    QString druckerName(int i) const override { return drucker.value(i); }
    void waehleDrucker(int i) override
    {
        protokolliere(QStringLiteral("waehleDrucker"), QString::number(i));
        if (i < 0 || i >= drucker.size())
            throw DruckerFehler("kein Drucker " + std::to_string(i));
        m_aktuell = i;
    }
    int schriftAnzahl() const override { return aktuelleSchriften().size(); }
    QString schriftName(int i) const override { return aktuelleSchriften().value(i); }

    void setzeEinheitPixel() override { protokolliere(QStringLiteral("setzeEinheitPixel")); }
    void setzeSchriftName(const QString &name) override
    {
        m_schrift = name;
        protokolliere(QStringLiteral("setzeSchriftName"), name);
    }
    void setzeSchriftGroesse(double punkte) override
    {
        m_groesse = punkte;
        protokolliere(QStringLiteral("setzeSchriftGroesse"));
    }
    void setzeFett(bool an) override { m_fett = an; }
    void setzeKursiv(bool an) override { m_kursiv = an; }

    double seitenBreite() const override { return m_breite; }
    double seitenHoehe() const override { return m_hoehe; }
    double textBreite(const QString &text) const override
    {
        return text.size() * m_groesse * (m_fett ? 1.5 : 1.0) * (m_kursiv ? 1.25 : 1.0);
    }
    double textHoehe(const QString &) const override { return 2 * m_groesse; }

    double x() const override { return m_x; }
    double y() const override { return m_y; }
    void setzeX(double x) override { m_x = x; }
    void setzeY(double y) override { m_y = y; }

    void drucke(const QString &text) override
    {
        zeichne(QStringLiteral("drucke"), text);
        m_x += textBreite(text);
    }
    void druckeZeile(const QString &text) override
    {
        zeichne(QStringLiteral("druckeZeile"), text);
        m_x = 0;
        m_y += textHoehe(text);
    }
    void neueSeite() override
    {
        protokolliere(QStringLiteral("neueSeite"));
        m_neueSeiteOffen = true;
        m_x = m_y = 0;
    }
    void beendeDokument() override
    {
        protokolliere(QStringLiteral("beendeDokument"));
        beendet = true;
    }
    void verwerfeDokument() noexcept override { verworfen = true; }

    // What was drawn, in order; texts only.
    std::vector<Aufruf> texte() const
    {
        std::vector<Aufruf> t;
        for (const auto &a : aufrufe)
            if (a.art == QLatin1String("drucke"))
                t.push_back(a);
        return t;
    }
    // The first drawn text equal to text; a default entry (empty art) when there is none.
    Aufruf gedruckt(const QString &text, int nummer = 1) const
    {
        for (const auto &a : aufrufe)
            if (a.art == QLatin1String("drucke") && a.text == text && --nummer == 0)
                return a;
        return {};
    }
    int anzahl(const QString &art) const
    {
        int n = 0;
        for (const auto &a : aufrufe)
            n += a.art == art;
        return n;
    }

    std::vector<Aufruf> aufrufe;
    int seiten = 1;
    bool beendet = false;
    bool verworfen = false;

private:
    QStringList aktuelleSchriften() const
    {
        auto it = schriften.find(drucker.value(m_aktuell));
        return it == schriften.end() ? QStringList() : it->second;
    }
    void protokolliere(const QString &art, const QString &text = {})
    {
        if (art == m_fehlerArt && --m_fehlerNach == 0)
            throw DruckerFehler("scripted failure", m_fehlerTyp, QStringLiteral("/x/PLAN.PDF"));
        aufrufe.push_back({art, text, m_x, m_y, m_groesse, m_fett, m_kursiv, seiten});
    }
    void zeichne(const QString &art, const QString &text)
    {
        if (m_neueSeiteOffen && !text.isEmpty()) {
            m_neueSeiteOffen = false;
            ++seiten;
        }
        protokolliere(art, text);
    }

    double m_breite;
    double m_hoehe;
    int m_aktuell = 0;
    QString m_schrift;
    double m_groesse = 0;
    bool m_fett = false;
    bool m_kursiv = false;
    double m_x = 0;
    double m_y = 0;
    bool m_neueSeiteOffen = false;
    QString m_fehlerArt;
    int m_fehlerNach = 0;
    DruckerFehler::Art m_fehlerTyp = DruckerFehler::Art::Dienst;
};
