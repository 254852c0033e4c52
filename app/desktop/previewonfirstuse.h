#pragma once

#include "automation/previewwindow.h"

#include <functional>
#include <memory>
#include <utility>

namespace penmoor {

// The preview window as the build driver uses it: the window is created at the first
// hand-over and stays created, so every later build reuses it.
template <typename Window> class PreviewOnFirstUse final : public PreviewWindow {
public:
    using Create = std::function<std::unique_ptr<Window>()>;

    explicit PreviewOnFirstUse(Create create)
        : m_create(std::move(create))
    {
    }

    void setPicture(xl::Picture picture) override { window().setPicture(std::move(picture)); }
    void setTempWorkbookPath(const std::filesystem::path& path) override { window().setTempWorkbookPath(path); }
    void show() override { window().show(); }

    // The window, or null before the first hand-over.
    Window* created() const { return m_window.get(); }

private:
    Window& window()
    {
        if (!m_window) {
            m_window = m_create();
        }
        return *m_window;
    }

    Create m_create;
    std::unique_ptr<Window> m_window;
};

} // namespace penmoor
