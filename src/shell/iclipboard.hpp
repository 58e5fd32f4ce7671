#pragma once

#include <QString>

namespace arbolex::shell {

/// The system clipboard as window logic sees it: a table goes there as plain
/// tab-separated text and as an HTML table in the same clipboard data, so a
/// paste into a spreadsheet lands one value per cell.
class IClipboard {
public:
    virtual ~IClipboard() = default;
    /// Replaces the clipboard's contents; false when the clipboard refused them.
    virtual bool setTable(const QString &plainText, const QString &html) = 0;
};

/// A clipboard without a screen: it keeps what was put there.
class HeadlessClipboard : public IClipboard {
public:
    bool setTable(const QString &plainText, const QString &html) override {
        m_text = plainText;
        m_html = html;
        return true;
    }
    const QString &text() const { return m_text; }
    const QString &html() const { return m_html; }

private:
    QString m_text;
    QString m_html;
};

} // namespace arbolex::shell
