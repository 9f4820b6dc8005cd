#pragma once

#include "platform/gpu/drawable.h"
#include "platform/gpu/renderpass.h"
#include "platform/shapes/crisppainteditem.h"

#include <optional>

namespace favrin::platform::gpu {

class Device;
class VexelView;

/** Draws what a VexelView shows. */
class VexelViewDelegate
{
public:
    virtual ~VexelViewDelegate() = default;
    /** Draws one frame into the view's current drawable and presents it. */
    virtual void draw(VexelView &view) = 0;
    /** The view's drawables have another size, in pixels, from now on. */
    virtual void drawableSizeWillChange(VexelView &view, QSize size) = 0;
};

/**
 * A view that shows what a device draws: its drawables have exactly the pixels that it covers on the screen.
 *
 * Paused with drawing on demand, it has its delegate draw once before the next frame after setNeedsDisplay(); paused
 * without, only by draw(); not paused, for every frame of the window. Until a drawable is presented it shows what was
 * presented last. Main thread only.
 */
class VexelView : public CrispPaintedItem
{
    Q_OBJECT

public:
    explicit VexelView(QQuickItem *parent = nullptr);

    const std::shared_ptr<Device> &device() const { return m_device; }
    void setDevice(std::shared_ptr<Device> device);
    VexelViewDelegate *delegate() const { return m_delegate; }
    /** Borrowed: null it before the delegate goes. A new delegate of a view that is displayed draws at once. */
    void setDelegate(VexelViewDelegate *delegate);

    PixelFormat colorPixelFormat() const { return PixelFormat::BGRA8Unorm; }
    /** Opaque views ignore what alpha their drawables hold. */
    bool isOpaque() const { return m_opaque; }
    void setOpaque(bool opaque) { m_opaque = opaque; }
    bool isPaused() const { return m_paused; }
    void setPaused(bool paused);
    bool enableSetNeedsDisplay() const { return m_enableSetNeedsDisplay; }
    void setEnableSetNeedsDisplay(bool enable) { m_enableSetNeedsDisplay = enable; }
    /** In points; the corners are cut off with continuous curvature. */
    double cornerRadius() const { return m_cornerRadius; }
    void setCornerRadius(double radius) { m_cornerRadius = radius; }

    /** In pixels; empty until the view is part of a window and has a size. */
    QSize drawableSize() const { return m_drawableSize; }
    /** Of the frame being drawn: clears and stores the current drawable. None when there is no drawable. */
    std::optional<RenderPassDescriptor> currentRenderPassDescriptor();
    /** The drawable of the frame being drawn; null without a device, without a size, or when none can be made. */
    std::shared_ptr<Drawable> currentDrawable();

    void setNeedsDisplay();
    /** Draws now, whatever the mode. */
    void draw();

    QImage render(double devicePixelRatio) override;

protected:
    void paint(QPainter &painter, QSize size, double devicePixelRatio) override;
    void updatePolish() override;
    void geometryChange(const QRectF &newGeometry, const QRectF &oldGeometry) override;
    void itemChange(ItemChange change, const ItemChangeData &value) override;

private:
    void present(QImage image);
    void drawForEveryFrame();

    std::shared_ptr<Device> m_device;
    VexelViewDelegate *m_delegate = nullptr;
    QSize m_drawableSize;
    std::shared_ptr<Drawable> m_drawable;
    QImage m_picture;
    double m_cornerRadius = 0.0;
    bool m_opaque = false;
    bool m_paused = false;
    bool m_enableSetNeedsDisplay = false;
    bool m_needsDisplay = false;
};

} // namespace favrin::platform::gpu
