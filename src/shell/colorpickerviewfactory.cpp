#include "shell/colorpickerviewfactory.h"

#include "service/colorpickerstate.h"

#include <QQmlEngine>
#include <QQuickItem>

namespace favrin::shell {
namespace {

QQmlEngine &withModules(QQmlEngine &engine)
{
    const auto path = QStringLiteral("qrc:/qt/qml");
    if (!engine.importPathList().contains(path))
        engine.addImportPath(path);
    return engine;
}

} // namespace

ColorPickerViewFactory::ColorPickerViewFactory(QQmlEngine &engine, Loading loading)
    : m_component(&withModules(engine), QUrl(QStringLiteral("qrc:/qt/qml/Favrin/Shell/ColorPickerView.qml")),
                  loading == Loading::Beside ? QQmlComponent::Asynchronous : QQmlComponent::PreferSynchronous)
{
}

void ColorPickerViewFactory::whenLoaded(std::function<void()> loaded)
{
    if (!m_component.isLoading())
        loaded();
    else
        QObject::connect(&m_component, &QQmlComponent::statusChanged, &m_component, std::move(loaded),
                         Qt::SingleShotConnection);
}

std::unique_ptr<QQuickItem> ColorPickerViewFactory::create(service::ColorPickerState &state)
{
    if (!m_component.isReady()) {
        qWarning("The color picker has no view: %s", qPrintable(m_component.errorString()));
        return nullptr;
    }
    const QVariantMap properties = {{QStringLiteral("colorPickerState"), QVariant::fromValue(&state)}};
    std::unique_ptr<QObject> object(m_component.createWithInitialProperties(properties));
    auto *view = qobject_cast<QQuickItem *>(object.get());
    if (!view)
        return nullptr;
    QQmlEngine::setObjectOwnership(view, QQmlEngine::CppOwnership);
    object.release();
    return std::unique_ptr<QQuickItem>(view);
}

} // namespace favrin::shell
