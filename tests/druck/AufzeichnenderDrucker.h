#pragma once

#include "output/Drucker.h"

#include <QStringList>

#include <vector>

// Logs every call and measures exactly, so layout tests check positions to the pixel:
// width = characters x size (x 1.5 bold, x 1.25 italic), height = 2 x size, the empty text too.
// As Drucker promises, a new page begins only when a non-empty text is drawn after neueSeite().
class AufzeichnenderDrucker : public Drucker
{
public:
    struct Aufruf {
        QString art, text;   // art: the operation, e.g. "drucke", "neueSeite"
        double x = 0, y = 0;
        bool fett = false, kursiv = false;
        int seite = 0;
    };

    explicit AufzeichnenderDrucker(double breite = 1000, double hoehe = 2000) : m_breite(breite), m_hoehe(hoehe) {}
    AufzeichnenderDrucker(QStringList namen, QList<QStringList> schriften) : drucker(namen), schriften(schriften) {}

    QStringList drucker;
    QList<QStringList> schriften;   // of printer i
    // The first call of the operation named scheitereBei throws a DruckerFehler of fehlerArt.
    QString scheitereBei;
    DruckerFehler::Art fehlerArt = DruckerFehler::Art::Dienst;
    std::vector<Aufruf> aufrufe;
    int seiten = 1;
    bool beendet = false, verworfen = false;

    int druckerAnzahl() const override { return drucker.size(); }
    QString druckerName(int i) const override { return drucker.value(i); }
    void waehleDrucker(int i) override
    {
        log("waehleDrucker", QString::number(i));
        if (i < 0 || i >= drucker.size())
            throw DruckerFehler("kein Drucker");
        m_aktuell = i;
    }
    int schriftAnzahl() const override { return schriften.value(m_aktuell).size(); }
    QString schriftName(int i) const override { return schriften.value(m_aktuell).value(i); }
    void setzeEinheitPixel() override { log("setzeEinheitPixel"); }
    void setzeSchriftName(const QString &name) override { log("setzeSchriftName", name); }
    void setzeSchriftGroesse(double pt) override { m_groesse = pt; log("setzeSchriftGroesse", QString::number(pt)); }
    void setzeFett(bool an) override { m_fett = an; }
    void setzeKursiv(bool an) override { m_kursiv = an; }
    double seitenBreite() const override { return m_breite; }
    double seitenHoehe() const override { return m_hoehe; }
    double textBreite(const QString &t) const override
    {
        return t.size() * m_groesse * (m_fett ? 1.5 : 1.0) * (m_kursiv ? 1.25 : 1.0);
    }
    double textHoehe(const QString &) const override { return 2 * m_groesse; }
    double x() const override { return m_x; }
    double y() const override { return m_y; }
    void setzeX(double x) override { m_x = x; }
    void setzeY(double y) override { m_y = y; }
    void drucke(const QString &t) override { log("drucke", t); m_x += textBreite(t); }
    void druckeZeile(const QString &t) override { log("druckeZeile", t); m_x = 0; m_y += textHoehe(t); }
    void neueSeite() override { log("neueSeite"); m_neueSeiteOffen = true; m_x = m_y = 0; }
    void beendeDokument() override { log("beendeDokument"); beendet = true; }
    void verwerfeDokument() noexcept override { verworfen = true; }

    // The texts of the calls of one operation, in order; texte("drucke") is what was drawn.
    QStringList texte(const QString &art) const
    {
        QStringList l;
        for (const auto &a : aufrufe)
            if (a.art == art)
                l << a.text;
        return l;
    }
    // The nummer-th drawing of text; an entry with empty art when there is none.
    Aufruf gedruckt(const QString &text, int nummer = 1) const
    {
        for (const auto &a : aufrufe)
            if (a.art == "drucke" && a.text == text && --nummer == 0)
                return a;
        return {};
    }

private:
    void log(const QString &art, const QString &text = {})
    {
        if (art == scheitereBei)
            throw DruckerFehler("scripted failure", fehlerArt, "/x/PLAN.PDF");
        if (m_neueSeiteOffen && art.startsWith("drucke") && !text.isEmpty()) {
            m_neueSeiteOffen = false;
            ++seiten;
        }
        aufrufe.push_back({art, text, m_x, m_y, m_fett, m_kursiv, seiten});
    }

    double m_breite = 1000, m_hoehe = 2000;
    int m_aktuell = 0;
    double m_groesse = 0, m_x = 0, m_y = 0;
    bool m_fett = false, m_kursiv = false, m_neueSeiteOffen = false;
};
