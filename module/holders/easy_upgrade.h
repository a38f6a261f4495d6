#pragma once

class TzDbObject;

// Makes an object that is open for read writable, and gives the write back at the end.
//
//   CEasyUpgrade writable;
//   if (!text->isWriteEnabled() && !writable.Upgrade(text)) return;
//
// One holder serves one object, which stays open at least as long as the holder lives: a second
// object that is upgraded takes the first one's place, and the first stays open for write.
class CEasyUpgrade {
public:
    CEasyUpgrade() = default;
    CEasyUpgrade(CEasyUpgrade const&) = delete;
    CEasyUpgrade& operator=(CEasyUpgrade const&) = delete;
    virtual ~CEasyUpgrade();

    // True when this holder has made the object writable, now or by an earlier call. False when the
    // host refuses, and for an object that was writable before the holder's first upgrade.
    [[nodiscard]] virtual bool Upgrade(TzDbObject* toUpgrade);
    // Gives back what Upgrade took; the destructor does the same.
    virtual void Downgrade();

private:
    TzDbObject* object = nullptr;  // the object that this holder upgraded
    bool upgraded = false;
};
