#pragma once

class TzDbObject;

// Makes an object writable for a while and gives that back.
//
//   CEasyUpgrade writable;
//   if (!text->isWriteEnabled() && !writable.Upgrade(text)) return;
//
// The object stays open at least as long as the holder lives.
class CEasyUpgrade {
public:
    CEasyUpgrade() = default;
    CEasyUpgrade(CEasyUpgrade const&) = delete;
    CEasyUpgrade& operator=(CEasyUpgrade const&) = delete;
    virtual ~CEasyUpgrade();

    // Whether this holder has made the object writable, now or before; false for an object that is
    // writable by itself, and when the host refuses.
    virtual bool Upgrade(TzDbObject* toUpgrade);
    // Gives back what Upgrade took; the destructor does the same.
    virtual void Downgrade();

private:
    TzDbObject* object = nullptr;  // the object that this holder upgraded
    bool upgraded = false;
};
