#pragma once

namespace orvex {

// What a list screen asks of the application.
class PaneHost {
public:
    virtual ~PaneHost() = default;

    // Whether the toolbar has a Save button.
    virtual bool offersSaveButton() const = 0;
    virtual void showSaveView() = 0;
};

} // namespace orvex
