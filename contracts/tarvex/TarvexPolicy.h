#pragma once

#include <map>
#include <string>

/// Import options passed through to the importers. A value object: named flags, each
/// present or absent.
class TarvexPolicy {
public:
    void SetOption(std::string const& name, bool value) { m_options[name] = value; }
    /// True and the value if the option is set; otherwise false and `value` untouched.
    bool GetOption(std::string const& name, bool& value) const;

private:
    std::map<std::string, bool> m_options;
};
