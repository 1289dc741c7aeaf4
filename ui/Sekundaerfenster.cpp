#include "ui/Sekundaerfenster.h"

#include <QDialog>
#include <QEvent>
#include <QKeyEvent>
#include <QPointer>
#include <QScreen>
#include <QWidget>
#include <QWindow>

#include <utility>

namespace {

// Lives as a child of the secondary window. Whatever closes the window (a button, Escape, the
// close box, deletion) ends in one of the two ways below, and the main window is enabled again
// exactly once.
class Schliesswaechter : public QObject
{
public:
    Schliesswaechter(QWidget *fenster, QWidget *hauptfenster, std::function<void()> beimSchliessen)
        : QObject(fenster), m_fenster(fenster), m_haupt(hauptfenster), m_beimSchliessen(std::move(beimSchliessen))
    {
        fenster->installEventFilter(this);
        // Once the main window is gone there is nothing to restore, and its callbacks would
        // reach a destroyed object.
        connect(hauptfenster, &QObject::destroyed, this, [this] {
            m_haupt = nullptr;
            m_erledigt = true;
            m_fenster->deleteLater();
        });
    }

    ~Schliesswaechter() override { schliessen(); }

protected:
    bool eventFilter(QObject *, QEvent *e) override
    {
        // A spontaneous hide is minimising; only a hide by the program closes.
        if (e->type() == QEvent::Hide && !e->spontaneous())
            schliessen();
        else if (e->type() == QEvent::KeyPress && !qobject_cast<QDialog *>(m_fenster)) {
            // Dialogs handle Escape themselves; plain windows close on it here.
            auto *k = static_cast<QKeyEvent *>(e);
            if (k->key() == Qt::Key_Escape && k->modifiers() == Qt::NoModifier) {
                m_fenster->close();
                return true;
            }
        }
        return false;
    }

private:
    void schliessen()
    {
        if (m_erledigt)
            return;
        m_erledigt = true;
        if (m_haupt) {
            m_haupt->setEnabled(true);
            if (m_beimSchliessen)
                m_beimSchliessen();
        }
    }

    QWidget *m_fenster;
    QPointer<QWidget> m_haupt;
    std::function<void()> m_beimSchliessen;
    bool m_erledigt = false;
};

void zentriere(QWidget *fenster, QWidget *hauptfenster)
{
    QScreen *bildschirm = hauptfenster->screen();
    if (!bildschirm)
        return;
    fenster->adjustSize();
    const QRect flaeche = bildschirm->availableGeometry();
    const QSize groesse = fenster->frameSize().expandedTo(fenster->size());
    fenster->move(flaeche.x() + (flaeche.width() - groesse.width()) / 2,
                  flaeche.y() + (flaeche.height() - groesse.height()) / 2);
}

} // namespace

void ZeigeSekundaerfenster(QWidget *fenster, QWidget *hauptfenster, std::function<void()> beimSchliessen)
{
    // Disabling a widget disables its child windows, so the secondary window must not be a
    // child of the main window. It is kept above it as a transient window instead.
    if (fenster->parentWidget())
        fenster->setParent(nullptr, fenster->windowFlags() | Qt::Window);
    else
        fenster->setWindowFlags(fenster->windowFlags() | Qt::Window);
    fenster->setAttribute(Qt::WA_DeleteOnClose);
    fenster->setWindowModality(Qt::NonModal);
    new Schliesswaechter(fenster, hauptfenster, std::move(beimSchliessen));

    hauptfenster->setEnabled(false);
    zentriere(fenster, hauptfenster);
    fenster->winId();
    if (QWindow *eigenes = fenster->windowHandle()) {
        hauptfenster->winId();
        eigenes->setTransientParent(hauptfenster->windowHandle());
    }
    fenster->show();
    fenster->raise();
    fenster->activateWindow();
}
