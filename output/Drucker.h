#pragma once

#include <QString>

#include <stdexcept>

// A failure of the printer service: a printer that does not exist, a document the service
// refuses, a file that cannot be written. Every operation of Drucker may throw it; the print
// job catches it, discards the document and reports it.
class DruckerFehler : public std::runtime_error
{
public:
    enum class Art { Dienst, Datei };

    explicit DruckerFehler(const std::string &grund, Art art = Art::Dienst, QString pfad = {})
        : std::runtime_error(grund), m_art(art), m_pfad(std::move(pfad))
    {
    }

    Art art() const { return m_art; }
    // The file that could not be written, for Art::Datei.
    const QString &pfad() const { return m_pfad; }

private:
    Art m_art;
    QString m_pfad;
};

// The printer service as the print dialog and the print job see it: one current printer and one
// open document with a current page. Positions and sizes are in device pixels; text is drawn
// with its top left corner at the current position.
//
// Pages: a new page is started only when a non-empty text is drawn after neueSeite(), so a new
// page that receives nothing but empty texts before the end of the document adds no sheet.
class Drucker
{
public:
    virtual ~Drucker() = default;

    // Installed printers in a stable order; index i of this list chooses printer i.
    virtual int druckerAnzahl() const = 0;
    virtual QString druckerName(int i) const = 0;
    // Throws DruckerFehler for an index outside the list.
    virtual void waehleDrucker(int i) = 0;

    // Fonts of the current printer, usable as font names.
    virtual int schriftAnzahl() const = 0;
    virtual QString schriftName(int i) const = 0;

    // The only unit there is; kept as a call because the job sets it before anything else.
    virtual void setzeEinheitPixel() = 0;

    virtual void setzeSchriftName(const QString &name) = 0;
    virtual void setzeSchriftGroesse(double punkte) = 0;
    virtual void setzeFett(bool an) = 0;
    virtual void setzeKursiv(bool an) = 0;

    // The drawable area of the page.
    virtual double seitenBreite() const = 0;
    virtual double seitenHoehe() const = 0;

    // In the current font; the height of the empty text is the height of one line.
    virtual double textBreite(const QString &text) const = 0;
    virtual double textHoehe(const QString &text) const = 0;

    virtual double x() const = 0;
    virtual double y() const = 0;
    virtual void setzeX(double x) = 0;
    virtual void setzeY(double y) = 0;

    // Draws the text; X moves to its end, Y stays.
    virtual void drucke(const QString &text) = 0;
    // Draws the text; X returns to 0 and Y moves down one line.
    virtual void druckeZeile(const QString &text) = 0;

    // Output continues on a new page at (0, 0).
    virtual void neueSeite() = 0;
    // Closes the document and hands it to the printer (or writes the file).
    virtual void beendeDokument() = 0;
    // Drops the open document so that nothing of it is printed. Never throws.
    virtual void verwerfeDokument() noexcept = 0;
};
