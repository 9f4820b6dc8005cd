#pragma once

#include <QQmlComponent>

#include <functional>
#include <memory>

class QQmlEngine;
class QQuickItem;

namespace favrin::service {
class ColorPickerState;
}

namespace favrin::shell {

/**
 * Makes root views of the picker. The view is loaded when the factory is made, so that a factory made early leaves only
 * the making of the items. Main thread only; the engine must outlive the factory and every view it made.
 */
class ColorPickerViewFactory
{
public:
    enum class Loading {
        /** When the factory is made, it is over. */
        AtOnce,
        /** Beside the main thread, whose event loop has to run meanwhile. */
        Beside,
    };

    explicit ColorPickerViewFactory(QQmlEngine &engine, Loading loading = Loading::AtOnce);

    /** Calls @p loaded once, when loading is over, be it with an error; at once where it is over already. */
    void whenLoaded(std::function<void()> loaded);

    /**
     * To be called when the view is loaded. A root view of @p state, which must outlive it. Its implicit size is the
     * size of its content. Null, with a warning logged, when the view cannot be made.
     */
    std::unique_ptr<QQuickItem> create(service::ColorPickerState &state);

private:
    QQmlComponent m_component;
};

} // namespace favrin::shell
