#pragma once

// What the editing pages need of the main window: switching menus and toolbar between the idle
// and the editing state.
class Hauptfenster
{
public:
    virtual ~Hauptfenster() = default;
    virtual void MenueAktivieren() = 0;
    virtual void MenueDeaktivieren() = 0;
};
