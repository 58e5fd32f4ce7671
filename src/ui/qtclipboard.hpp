#pragma once

#include "shell/iclipboard.hpp"

namespace arbolex::ui {

/// The system clipboard: a table as plain text and as HTML in one clipboard data.
class QtClipboard : public shell::IClipboard {
public:
    bool setTable(const QString &plainText, const QString &html) override;
};

} // namespace arbolex::ui
