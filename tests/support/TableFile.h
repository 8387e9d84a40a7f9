/// Tab-separated tables of test data, of which lines that begin with "#" are headings.
///
///     for (std::vector<std::string> const& row : TestSupport::readTable("normalize.tsv"))
///         TestSupport::unitsOfHex(row[0]);   // "0061d83d" is u"a\xD83D", "-" is nothing
#ifndef QORN_TESTS_TABLEFILE_H
#define QORN_TESTS_TABLEFILE_H

#include <string>
#include <vector>

namespace TestSupport {

/// The parts of `text` between separators, empty ones included.
std::vector<std::string> splitText(std::string const& text, char separator);

/// The rows of a file of tests/data. Fails the running test where the file can't be read.
std::vector<std::vector<std::string>> readTable(std::string const& name);

/// Four digits a unit.
std::u16string unitsOfHex(std::string const& text);

} // namespace TestSupport

#endif
