#include "shell/seqfile.hpp"

#include "shell/vbformat.hpp"
#include "shell/vbtext.hpp"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QStringDecoder>

#include <cmath>
#include <limits>

namespace arbolex::shell {

namespace {

bool isBlank(QChar c) {
    return c == QLatin1Char(' ') || c == QLatin1Char('\t');
}
bool isLineEnd(QChar c) {
    return c == QLatin1Char('\r') || c == QLatin1Char('\n');
}

QString decode(const QByteArray &bytes) {
    QStringDecoder utf8(QStringConverter::Utf8); // skips a leading byte-order mark
    QString text = utf8(bytes);
    return utf8.hasError() ? QString::fromLatin1(bytes) : text;
}

} // namespace

SequentialReader::SequentialReader(const QString &path) {
    QFile file(path);
    if (!QFileInfo::exists(path)) {
        m_openError = RuntimeError::fileNotFound();
        return;
    }
    if (!file.open(QIODevice::ReadOnly)) {
        m_openError = RuntimeError::pathFileAccessError();
        return;
    }
    m_text = decode(file.readAll());
    m_open = true;
}

bool SequentialReader::atEnd() const {
    qsizetype i = m_pos;
    while (i < m_text.size() && (isBlank(m_text[i]) || isLineEnd(m_text[i]))) {
        ++i;
    }
    return i >= m_text.size();
}

bool SequentialReader::nextField(QString &field) {
    const qsizetype n = m_text.size();
    while (m_pos < n && isBlank(m_text[m_pos])) {
        ++m_pos;
    }
    if (m_pos >= n) {
        return false;
    }
    auto atDelimiter = [&] {
        return m_pos >= n || m_text[m_pos] == QLatin1Char(',') || isLineEnd(m_text[m_pos]);
    };
    if (m_text[m_pos] == QLatin1Char('"')) {
        const qsizetype start = ++m_pos;
        while (m_pos < n && m_text[m_pos] != QLatin1Char('"') && !isLineEnd(m_text[m_pos])) {
            ++m_pos;
        }
        field = m_text.mid(start, m_pos - start);
        while (!atDelimiter()) {
            ++m_pos;
        }
    } else {
        const qsizetype start = m_pos;
        while (!atDelimiter()) {
            ++m_pos;
        }
        field = m_text.mid(start, m_pos - start).trimmed();
    }
    // Consume the delimiter: a comma, or one line end (CR LF counts as one).
    if (m_pos < n) {
        const QChar c = m_text[m_pos++];
        if (c == QLatin1Char('\r') && m_pos < n && m_text[m_pos] == QLatin1Char('\n')) {
            ++m_pos;
        }
    }
    return true;
}

RuntimeError SequentialReader::readNumber(double &value) {
    if (!m_open) {
        return RuntimeError::badFileNameOrNumber();
    }
    QString field;
    if (!nextField(field)) {
        return RuntimeError::inputPastEndOfFile();
    }
    if (field.isEmpty()) {
        value = 0.0;
        return {};
    }
    if (!isNumeric(field)) {
        return RuntimeError::typeMismatch();
    }
    value = val(field);
    return {};
}

RuntimeError SequentialReader::readNumber(float &value) {
    double wide = 0.0;
    RuntimeError error = readNumber(wide);
    if (!error) {
        if (std::fabs(wide) > double(std::numeric_limits<float>::max())) {
            return RuntimeError::overflow();
        }
        value = static_cast<float>(wide);
    }
    return error;
}

RuntimeError SequentialReader::readInteger(std::int16_t &value) {
    double wide = 0.0;
    RuntimeError error = readNumber(wide);
    if (!error) {
        const double rounded = std::nearbyint(wide); // half to even
        if (rounded < std::numeric_limits<std::int16_t>::min() ||
            rounded > std::numeric_limits<std::int16_t>::max()) {
            return RuntimeError::overflow();
        }
        value = static_cast<std::int16_t>(rounded);
    }
    return error;
}

RuntimeError SequentialReader::readString(QString &value) {
    if (!m_open) {
        return RuntimeError::badFileNameOrNumber();
    }
    QString field;
    if (!nextField(field)) {
        return RuntimeError::inputPastEndOfFile();
    }
    value = field;
    return {};
}

SequentialWriter::SequentialWriter(const QString &path) : m_file(path) {
    if (!QFileInfo(path).absoluteDir().exists()) {
        m_openError = RuntimeError::pathNotFound();
        return;
    }
    if (!m_file.open(QIODevice::WriteOnly)) {
        m_openError = RuntimeError::pathFileAccessError();
        return;
    }
    m_open = true;
}

RuntimeError SequentialWriter::writeLine(const QString &text) {
    if (!m_open) {
        return RuntimeError::badFileNameOrNumber();
    }
    const QByteArray line = text.toUtf8() + "\r\n";
    if (m_file.write(line) != line.size()) {
        return RuntimeError::deviceIoError();
    }
    return {};
}

RuntimeError SequentialWriter::writeNumber(double value) {
    return writeLine(generalNumber(value));
}

RuntimeError SequentialWriter::writeSingle(float value) {
    return writeLine(singleText(value));
}

RuntimeError SequentialWriter::writeInteger(int value) {
    return writeLine(QString::number(value));
}

RuntimeError SequentialWriter::writeString(const QString &value) {
    return writeLine(QLatin1Char('"') + value + QLatin1Char('"'));
}

RuntimeError SequentialWriter::close() {
    if (!m_open) {
        return {}; // closing a file that never opened is no failure
    }
    m_open = false;
    return m_file.commit() ? RuntimeError{} : RuntimeError::deviceIoError();
}

} // namespace arbolex::shell
