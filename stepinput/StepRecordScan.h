#pragma once

#include <string>
#include <unordered_set>

namespace VizBridgeStep {

/// Checks the record structure of an exchange-structure file, fed one character at a time so
/// that the file is never whole in memory: every statement of a data section must begin with
/// an entity name "#<number>=", and no name may be given twice. Strings and comments are
/// skipped, so that a ';' or a "#1=" inside them counts for nothing; a comment separates
/// tokens like white space. Parameters are not looked at.
class StepRecordScan {
public:
    void Feed(char c);

    /// Says that the file ends here: a string, a comment or a data section still open is a
    /// fault too.
    void Finish();

    /// The first fault in file order, as "<what> (line <n>)"; empty while there is none.
    std::string const& Fault() const { return m_fault; }

private:
    enum class Place { Statement, Keyword, Name, AfterName, Body };

    void separate();
    void token(char c);
    void endStatement();
    void fault(std::string what, long long line);

    Place m_place = Place::Statement;
    bool m_string = false, m_comment = false, m_slash = false, m_star = false;
    bool m_inData = false;
    bool m_named = false;  ///< the statement began with a name and its '='
    bool m_digits = false; ///< the name being read has a digit
    std::string m_keyword; ///< of a statement that does not begin with '#'
    unsigned long long m_name = 0;
    long long m_line = 1, m_statementLine = 1;
    long long m_openLine = 1; ///< where the string or comment began
    std::unordered_set<unsigned long long> m_names;
    std::string m_fault;
};

} // namespace VizBridgeStep
