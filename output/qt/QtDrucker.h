#pragma once

#include "output/Drucker.h"

#include <QFont>
#include <QPointF>
#include <QString>
#include <QStringList>

#include <memory>
#include <vector>

class QPagedPaintDevice;
class QPaintDevice;
class QPdfWriter;
class QPrinter;

// The printer service of the system (QPrinterInfo / QPrinter), or an A4 PDF file.
//
// The job's text is collected page by page and only handed to the device in beendeDokument(), so
// that verwerfeDokument() can really drop a document: Qt cannot take back a page once a painter
// has sent it to the spooler. Measuring needs no open document; it uses the device's metrics.
// Needs a QGuiApplication (fonts).
class QtDrucker : public Drucker
{
public:
    // The system's printers.
    QtDrucker();
    // PDF mode: one printer, "PDF-Datei", whose document is written to pfad. The file is written
    // through a temporary file, so a failure leaves an older file at pfad as it was.
    static std::unique_ptr<QtDrucker> pdfDatei(const QString &pfad);
    ~QtDrucker() override;

    int druckerAnzahl() const override;
    QString druckerName(int i) const override;
    void waehleDrucker(int i) override;
    int schriftAnzahl() const override;
    QString schriftName(int i) const override;

    void setzeEinheitPixel() override {}
    void setzeSchriftName(const QString &name) override;
    void setzeSchriftGroesse(double punkte) override;
    void setzeFett(bool an) override;
    void setzeKursiv(bool an) override;

    double seitenBreite() const override;
    double seitenHoehe() const override;
    double textBreite(const QString &text) const override;
    double textHoehe(const QString &text) const override;

    double x() const override { return m_x; }
    double y() const override { return m_y; }
    void setzeX(double x) override { m_x = x; }
    void setzeY(double y) override { m_y = y; }

    void drucke(const QString &text) override;
    void druckeZeile(const QString &text) override;
    void neueSeite() override;
    void beendeDokument() override;
    void verwerfeDokument() noexcept override;

    // Pages the document holds so far (at least 1).
    int seitenAnzahl() const { return int(m_seiten.size()); }

    static const QString PdfDruckerName;

private:
    struct PdfModus {};
    QtDrucker(PdfModus, const QString &pfad);

    struct Text {
        QFont schrift;
        QPointF grundlinie;
        QString text;
    };
    using Seite = std::vector<Text>;

    QPaintDevice &geraet() const;
    void zeichne(const QString &text);
    void gibAus(QPagedPaintDevice &geraet, DruckerFehler::Art art);
    void schreibePdf();
    void druckeAufDrucker();

    QStringList m_druckerNamen;
    QString m_pdfPfad;                   // PDF mode when not empty
    std::unique_ptr<QPrinter> m_drucker;
    std::unique_ptr<QPdfWriter> m_pdfMasse;  // metrics of the PDF page; never written
    mutable QStringList m_schriften;

    QFont m_schrift;
    double m_x = 0;
    double m_y = 0;
    std::vector<Seite> m_seiten{1};
    bool m_neueSeiteOffen = false;
};
