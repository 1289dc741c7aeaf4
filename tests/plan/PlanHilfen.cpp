#include "PlanHilfen.h"

#include "data/Datum.h"

InitMini Gemeinde(int n)
{
    InitMini d;
    d.Minis.resize(std::size_t(n) + 1);
    for (int i = 0; i < n; ++i) {
        d.Minis[std::size_t(i)].Name = QStringLiteral("Name %1").arg(i);
        d.Minis[std::size_t(i)].Vorname = QStringLiteral("Vorname %1").arg(i);
        d.Minis[std::size_t(i)].Strasse = QStringLiteral("Weg %1").arg(i);
    }
    d.AnzahlMinis = int16_t(n);
    d.Sperre.assign(std::size_t(n) + 1, 0);
    d.Einsaetze.assign(std::size_t(n) + 1, 0);
    return d;
}

void SetzeRegulaer(InitMini &d, int tag, std::initializer_list<const char *> anzahlen)
{
    int k = 0;
    for (const char *anzahl : anzahlen) {
        d.Regulaer[std::size_t(tag)].Zeit[std::size_t(k)] = QStringLiteral("Zeit %1").arg(k + 1);
        d.Regulaer[std::size_t(tag)].MiniAnz[std::size_t(k)] = QString::fromUtf8(anzahl);
        ++k;
    }
}

void SetzeJedenTag(InitMini &d, std::initializer_list<const char *> anzahlen)
{
    for (int tag = 1; tag <= 7; ++tag)
        SetzeRegulaer(d, tag, anzahlen);
}

AusnahmeSeite Seite(const QString &datum, std::initializer_list<const char *> anzahlen)
{
    AusnahmeSeite s;
    s.Datum = datum;
    int k = 0;
    for (const char *anzahl : anzahlen) {
        s.Zeit[std::size_t(k)] = QStringLiteral("Fest %1").arg(k + 1);
        s.MiniAnz[std::size_t(k)] = QString::fromUtf8(anzahl);
        ++k;
    }
    return s;
}

QDate D(const char *text)
{
    return *LeseDatum(QString::fromLatin1(text));
}
