#pragma once

#include "remote/remotehost.h"

#include <QSizeF>
#include <QStringList>

/** A host that writes down what it hears, in order. */
class RecordedHost : public favrin::remote::RemoteHost
{
public:
    struct Pick
    {
        std::optional<favrin::platform::Color> color;
        std::optional<std::string> colorspace;
        bool isVolatile = false;
        bool operator==(const Pick &) const = default;
    };

    void pickerDidSelectColor(const std::optional<favrin::platform::Color> &color,
                              const std::optional<std::string> &colorspace, bool isVolatile) override
    {
        messages << QStringLiteral("pick");
        picks.push_back({color, colorspace, isVolatile});
    }
    void pickerDidShowEyedropper() override { messages << QStringLiteral("show"); }
    void pickerDidFloatEyedropper() override { messages << QStringLiteral("float"); }
    void pickerDidDismissEyedropper() override { messages << QStringLiteral("dismiss"); }
    void colorPickerDidFinish() override { messages << QStringLiteral("finish"); }
    void preferredContentSizeDidChange(double width, double height) override { sizes.push_back({width, height}); }
    void backgroundEffectDidChange(favrin::remote::BackgroundEffect effect) override { effects.push_back(effect); }

    QStringList messages;
    std::vector<Pick> picks;
    std::vector<QSizeF> sizes;
    std::vector<favrin::remote::BackgroundEffect> effects;
};
