#pragma once

#include <QQmlComponent>

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
    explicit ColorPickerViewFactory(QQmlEngine &engine);

    /**
     * A root view of @p state, which must outlive it. Its implicit size is the size of its content. Null, with a
     * warning logged, when the view cannot be made.
     */
    std::unique_ptr<QQuickItem> create(service::ColorPickerState &state);

private:
    QQmlComponent m_component;
};

} // namespace favrin::shell
