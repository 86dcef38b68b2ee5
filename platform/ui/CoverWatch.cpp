#include "CoverWatch.h"

#include <QGuiApplication>
#include <QLatin1String>

#include <xcb/xcb.h>

#include <cstdint>
#include <cstdlib>
#include <memory>
#include <utility>

namespace orvex {

namespace {

// Beside the events that Qt has asked for.
void selectVisibilityEvents(xcb_connection_t* server, xcb_window_t window)
{
    const std::unique_ptr<xcb_get_window_attributes_reply_t, decltype(&std::free)> attributes(
        xcb_get_window_attributes_reply(server, xcb_get_window_attributes(server, window), nullptr),
        std::free);
    if (!attributes)
        return;
    const std::uint32_t events = attributes->your_event_mask | XCB_EVENT_MASK_VISIBILITY_CHANGE;
    xcb_change_window_attributes(server, window, XCB_CW_EVENT_MASK, &events);
}

} // namespace

CoverWatch::CoverWatch(WId window, std::function<void(bool isCovered)> onChange)
    : _window(window)
    , _onChange(std::move(onChange))
{
    // Asked by name: the offscreen platform has the interface too, without a connection.
    if (QGuiApplication::platformName() != QLatin1String("xcb"))
        return;
    const auto* const x11 = qGuiApp->nativeInterface<QNativeInterface::QX11Application>();
    selectVisibilityEvents(x11->connection(), static_cast<xcb_window_t>(window));
    qGuiApp->installNativeEventFilter(this);
}

bool CoverWatch::nativeEventFilter(const QByteArray&, void* message, qintptr*)
{
    constexpr unsigned kSentByClient = 0x80;
    const auto* const event = static_cast<const xcb_generic_event_t*>(message);
    if ((event->response_type & ~kSentByClient) != XCB_VISIBILITY_NOTIFY)
        return false;
    const auto* const visibility = static_cast<const xcb_visibility_notify_event_t*>(message);
    if (visibility->window == _window)
        _onChange(visibility->state == XCB_VISIBILITY_FULLY_OBSCURED);
    return false;
}

} // namespace orvex
