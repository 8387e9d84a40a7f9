/// Shared libraries for tests to load, and what these tell of themselves (Linux).
///
///     TestSupport::copyLibrary("First", "Demo.bundle/Contents/Linux/Demo");
///     ... load and unload it ...
///     TestSupport::moduleEvents();   // "+First", "-First"
#ifndef QORN_TESTS_TESTLIBRARIES_H
#define QORN_TESTS_TESTLIBRARIES_H

#include "support/FileRoot.h"

#include <string>
#include <vector>

namespace TestSupport {

/// The libraries "First" and "Second" need nothing; "Dependent" needs "apart/Dependency" and does
/// not find it by itself. Each of them has:
///
///     char const* libraryName()    its name
///     int libraryNumber            42
///     int onlyInFirst()            1; likewise for the others' names
///     int grüßen()                 7
///     symbolAtNull                 at the address null
void copyLibrary(std::string const& name, std::string const& file);

/// The folder that the libraries are built in, each as "<name>.so".
std::string libraryFolder();

/// "+<name>" for each library that was loaded, "-<name>" for each that was unloaded, in order,
/// since the last CEmptyFolder was made.
std::vector<std::string> const& moduleEvents();

/// Writes a file, and makes the folders that it lies in.
void layFile(std::string const& file, std::string const& content);

/// While it lives, the working directory is the file root's empty folder, so that files are named
/// from there and the name of the temporary folder may be of any bytes.
class CEmptyFolder {
  public:
    CEmptyFolder();
    ~CEmptyFolder();
    CEmptyFolder(CEmptyFolder const&) = delete;
    CEmptyFolder& operator=(CEmptyFolder const&) = delete;

  private:
    CFileRoot const root_;
};

} // namespace TestSupport

#endif
