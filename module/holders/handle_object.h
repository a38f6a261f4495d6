#pragma once

// Owns one handle of the host's and closes it at the end.
//
//   CHandleObject file;
//   if (!file.Attach(handle)) return;
class CHandleObject {
public:
    CHandleObject() = default;
    CHandleObject(CHandleObject const&) = delete;
    CHandleObject& operator=(CHandleObject const&) = delete;
    virtual ~CHandleObject();

    [[nodiscard]] virtual bool IsAttached() const;
    // Takes a handle over without closing one held before. The invalid handle, all bits set, is
    // refused and gives false; null gives false too, but is stored.
    [[nodiscard]] virtual bool Attach(void* newHandle);
    virtual bool operator=(void* newHandle);
    // Hands the handle to the caller, open as it is.
    [[nodiscard]] virtual void* Detach();
    // Closes the handle; false without one, or when the host refused.
    [[nodiscard]] virtual bool Close();
    virtual operator void*() const;
    [[nodiscard]] virtual void* Handle() const;

private:
    void* handle = nullptr;
};
