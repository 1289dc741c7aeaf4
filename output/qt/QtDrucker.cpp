#include "output/qt/QtDrucker.h"

#include <QFontDatabase>
#include <QFontMetricsF>
#include <QPageLayout>
#include <QPageSize>
#include <QPainter>
#include <QPdfWriter>
#include <QPrinter>
#include <QPrinterInfo>
#include <QSaveFile>

#include <algorithm>

const QString QtDrucker::PdfDruckerName = QStringLiteral("PDF-Datei");

namespace {

// A4 with the unprintable border of a usual office printer, so that a PDF looks like a sheet
// from the printer.
void RichtePdfEin(QPdfWriter &pdf)
{
    pdf.setPageLayout(QPageLayout(QPageSize(QPageSize::A4), QPageLayout::Portrait, QMarginsF(5, 5, 5, 5),
                                  QPageLayout::Millimeter));
    pdf.setResolution(1200);
    pdf.setCreator(QStringLiteral("Pradilon"));
    pdf.setTitle(QStringLiteral("Ministrantenplan"));
}

QStringList SystemSchriften()
{
    QStringList schriften;
    for (const QString &familie : QFontDatabase::families()) {
        if (!QFontDatabase::isPrivateFamily(familie))
            schriften << familie;
    }
    return schriften;
}

} // namespace

QtDrucker::QtDrucker()
{
    m_druckerNamen = QPrinterInfo::availablePrinterNames();
    // The service reports in no promised order; sorting keeps index i on the same printer.
    std::sort(m_druckerNamen.begin(), m_druckerNamen.end(), [](const QString &a, const QString &b) {
        const int c = QString::compare(a, b, Qt::CaseInsensitive);
        return c != 0 ? c < 0 : a < b;
    });
}

QtDrucker::QtDrucker(PdfModus, const QString &pfad) : m_druckerNamen{PdfDruckerName}, m_pdfPfad(pfad) {}

std::unique_ptr<QtDrucker> QtDrucker::pdfDatei(const QString &pfad)
{
    return std::unique_ptr<QtDrucker>(new QtDrucker(PdfModus{}, pfad));
}

QtDrucker::~QtDrucker() = default;

int QtDrucker::druckerAnzahl() const
{
    return m_druckerNamen.size();
}

QString QtDrucker::druckerName(int i) const
{
    return m_druckerNamen.value(i);
}

void QtDrucker::waehleDrucker(int i)
{
    if (i < 0 || i >= m_druckerNamen.size())
        throw DruckerFehler("Drucker " + std::to_string(i) + " gibt es nicht");
    if (!m_pdfPfad.isEmpty()) {
        m_pdfMasse = std::make_unique<QPdfWriter>(QString());
        RichtePdfEin(*m_pdfMasse);
    } else {
        auto drucker = std::make_unique<QPrinter>(QPrinterInfo::printerInfo(m_druckerNamen[i]), QPrinter::HighResolution);
        if (!drucker->isValid())
            throw DruckerFehler("Drucker " + m_druckerNamen[i].toStdString() + " ist nicht bereit");
        drucker->setDocName(QStringLiteral("Ministrantenplan"));
        m_drucker = std::move(drucker);
    }
    m_schriften = SystemSchriften();
    verwerfeDokument();
}

int QtDrucker::schriftAnzahl() const
{
    return m_schriften.size();
}

QString QtDrucker::schriftName(int i) const
{
    return m_schriften.value(i);
}

void QtDrucker::setzeSchriftName(const QString &name)
{
    m_schrift.setFamily(name);
}

void QtDrucker::setzeSchriftGroesse(double punkte)
{
    if (punkte > 0)
        m_schrift.setPointSizeF(punkte);
}

void QtDrucker::setzeFett(bool an)
{
    m_schrift.setBold(an);
}

void QtDrucker::setzeKursiv(bool an)
{
    m_schrift.setItalic(an);
}

QPaintDevice &QtDrucker::geraet() const
{
    if (m_pdfMasse)
        return *m_pdfMasse;
    if (m_drucker)
        return *m_drucker;
    throw DruckerFehler("kein Drucker gewählt");
}

double QtDrucker::seitenBreite() const
{
    return geraet().width();
}

double QtDrucker::seitenHoehe() const
{
    return geraet().height();
}

double QtDrucker::textBreite(const QString &text) const
{
    return QFontMetricsF(m_schrift, &geraet()).horizontalAdvance(text);
}

double QtDrucker::textHoehe(const QString &) const
{
    return QFontMetricsF(m_schrift, &geraet()).lineSpacing();
}

void QtDrucker::zeichne(const QString &text)
{
    if (text.isEmpty())
        return;
    if (m_neueSeiteOffen) {
        m_seiten.emplace_back();
        m_neueSeiteOffen = false;
    }
    const double oberkante = QFontMetricsF(m_schrift, &geraet()).ascent();
    m_seiten.back().push_back({m_schrift, QPointF(m_x, m_y + oberkante), text});
}

void QtDrucker::drucke(const QString &text)
{
    zeichne(text);
    m_x += textBreite(text);
}

void QtDrucker::druckeZeile(const QString &text)
{
    zeichne(text);
    m_x = 0;
    m_y += textHoehe(text);
}

void QtDrucker::neueSeite()
{
    m_neueSeiteOffen = true;
    m_x = 0;
    m_y = 0;
}

void QtDrucker::gibAus(QPagedPaintDevice &ziel, DruckerFehler::Art art)
{
    QPainter maler;
    if (!maler.begin(&ziel))
        throw DruckerFehler("Dokument kann nicht begonnen werden", art, m_pdfPfad);
    for (size_t s = 0; s < m_seiten.size(); ++s) {
        if (s > 0 && !ziel.newPage()) {
            maler.end();
            throw DruckerFehler("keine neue Seite", art, m_pdfPfad);
        }
        for (const Text &t : m_seiten[s]) {
            maler.setFont(t.schrift);
            maler.drawText(t.grundlinie, t.text);
        }
    }
    if (!maler.end())
        throw DruckerFehler("Dokument kann nicht abgeschlossen werden", art, m_pdfPfad);
}

void QtDrucker::schreibePdf()
{
    const auto art = DruckerFehler::Art::Datei;
    QSaveFile datei(m_pdfPfad);
    if (!datei.open(QIODevice::WriteOnly))
        throw DruckerFehler(datei.errorString().toStdString(), art, m_pdfPfad);
    {
        QPdfWriter pdf(&datei);
        RichtePdfEin(pdf);
        gibAus(pdf, art);
    }
    // The writer reports no failed write; the save file remembers it and refuses to commit.
    if (!datei.commit())
        throw DruckerFehler(datei.errorString().toStdString(), art, m_pdfPfad);
}

void QtDrucker::druckeAufDrucker()
{
    gibAus(*m_drucker, DruckerFehler::Art::Dienst);
    if (m_drucker->printerState() == QPrinter::Error)
        throw DruckerFehler("der Drucker meldet einen Fehler");
}

void QtDrucker::beendeDokument()
{
    if (!m_pdfPfad.isEmpty()) {
        if (!m_pdfMasse)
            throw DruckerFehler("kein Drucker gewählt");
        schreibePdf();
    } else {
        if (!m_drucker)
            throw DruckerFehler("kein Drucker gewählt");
        druckeAufDrucker();
    }
    verwerfeDokument();
}

void QtDrucker::verwerfeDokument() noexcept
{
    m_seiten.assign(1, Seite());
    m_neueSeiteOffen = false;
    m_x = 0;
    m_y = 0;
}
