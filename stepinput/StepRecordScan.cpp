#include <VizBridge/stepinput/StepRecordScan.h>

#include <cctype>
#include <utility>

namespace VizBridgeStep {

void StepRecordScan::Feed(char const c) {
    if (c == '\n')
        ++m_line;
    if (m_comment) {
        m_comment = !(m_star && c == '/');
        m_star = c == '*';
        return;
    }
    if (m_string) {
        m_string = c != '\''; // a doubled quote closes and reopens at once
        return;
    }
    if (m_slash) {
        m_slash = false;
        if (c == '*') {
            m_comment = true;
            m_star = false;
            m_openLine = m_line;
            separate();
            return;
        }
        token('/');
    }
    if (c == '/')
        m_slash = true;
    else if (c == ';')
        endStatement();
    else if (std::isspace(static_cast<unsigned char>(c)))
        separate();
    else
        token(c);
}

void StepRecordScan::separate() {
    if (m_place == Place::Name)
        m_place = Place::AfterName;
    else if (m_place == Place::Keyword)
        m_place = Place::Body;
}

void StepRecordScan::token(char const c) {
    if (m_place == Place::Statement)
        m_statementLine = m_line;
    bool const keyChar = std::isalnum(static_cast<unsigned char>(c)) || c == '_' || c == '-';
    switch (m_place) {
    case Place::Statement:
        m_place = c == '#' ? Place::Name : keyChar ? Place::Keyword : Place::Body;
        m_name = 0;
        m_digits = false;
        m_keyword.clear();
        if (m_place == Place::Keyword)
            m_keyword += c;
        break;
    case Place::Keyword:
        if (keyChar && m_keyword.size() < 32)
            m_keyword += c;
        else
            m_place = Place::Body;
        break;
    case Place::Name:
        if (c >= '0' && c <= '9' && m_name < (1ull << 60)) {
            m_name = m_name * 10 + static_cast<unsigned long long>(c - '0');
            m_digits = true;
            break;
        }
        [[fallthrough]];
    case Place::AfterName:
        if (c == '=' && m_digits) {
            m_named = true;
            if (!m_names.insert(m_name).second)
                fault("the entity name #" + std::to_string(m_name) + " is given twice",
                      m_statementLine);
        }
        m_place = Place::Body;
        break;
    case Place::Body:
        break;
    }
    if (c == '\'') {
        m_string = true;
        m_openLine = m_line;
    }
}

void StepRecordScan::endStatement() {
    if (m_inData && !m_named && m_keyword != "ENDSEC")
        fault("a record does not begin with an entity name #<number>=", m_statementLine);
    if (m_keyword == "DATA")
        m_inData = true;
    else if (m_keyword == "ENDSEC")
        m_inData = false;
    m_place = Place::Statement;
    m_named = false;
    m_keyword.clear();
}

void StepRecordScan::Finish() {
    if (m_string)
        fault("a string is never closed", m_openLine);
    else if (m_comment)
        fault("a comment is never closed", m_openLine);
    else if (m_inData)
        fault("a data section is never closed", m_line);
}

void StepRecordScan::fault(std::string what, long long const line) {
    if (m_fault.empty())
        m_fault = std::move(what) + " (line " + std::to_string(line) + ")";
}

} // namespace VizBridgeStep
