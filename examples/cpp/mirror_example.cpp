// Mirrors a folder into another one, three times: copies what is new or has changed, deletes what
// has gone, logs both, and goes on behind an entry that fails.
//
// Prints:
//     first run
//     [SevInfo] Mirror: copied ada.txt
//     [SevInfo] Mirror: copied archive
//     [SevInfo] Mirror: copied archive/2020
//     [SevInfo] Mirror: copied archive/2020/may.txt
//     after changes
//     [SevInfo] Mirror: deleted archive/2020
//     [SevInfo] Mirror: copied ada.txt
//     [SevInfo] Mirror: copied charles.txt
//     [SevWarn] Mirror: left out joan.txt: No such file or directory
//     [SevInfo] Mirror: copied archive/2021.txt
//     once more
//     [SevWarn] Mirror: left out joan.txt: No such file or directory

#include "1Base/Error/Error.h"
#include "1Base/Error/ErrorLogTargets.h"
#include "1Base/Streams/StreamsFile.h"
#include "2System/FileSys/FileSys.h"

#include <unistd.h>

#include <iostream>
#include <sstream>
#include <string>

namespace {

using FileSys::CDirIterator;
using FileSys::CFileInfo;
using FileSys::CFileSpec;

TEMPLMETA_TAG_NAME(Mirror);

using TLoggerMirror =
    Error::CLogger<TemplMeta::CTag<CTag_Name_Mirror<char const*>>, Error::TStdSeverities,
                   Error::TStdTargets, Error::CGlobalLogger, TemplMeta::CAnd>;

// Without the paths, which the whole text of a failure names.
Strings::string reasonOf(Error::CException const& exc) {
    Error::CMessage const& message = exc.getInfo().getMessage();
    for (auto const& parameter : message)
        if (parameter.getName() == "reason")
            return parameter.getValue();
    return message.getString(true);
}

// Calls `act` with each entry below a folder and its path from there. What fails is logged and
// passed over.
template <class TAct>
void forEachEntry(CFileSpec const& folder, TAct const& act) {
    CDirIterator const end;
    for (CDirIterator entry(folder, CDirIterator::eRecursive,
                            CDirIterator::eFiles | CDirIterator::eFolders);
         entry != end; ++entry) {
        Strings::string const name = entry->getRelativePath(folder).getFullName(false);
        try {
            act(*entry, name);
        } catch (Error::CException const& exc) {
            Strings::string const reason = reasonOf(exc);
            ERROR_LOG(TLoggerMirror, Error::TTgtLogger, Error::TSevWarn,
                      "left out @(name): @(reason)",
                      ERROR_PARAMS(ERROR_PARAM(name), ERROR_PARAM(reason)));
        }
    }
}

// Asked of CFileInfo, which raises where the disk doesn't answer. exists() says no there, and a
// folder that can't be entered for a moment would lose its copies.
bool hasGone(CFileSpec const& original, CFileSpec const& copy) {
    ERROR_BLOCK_BEGIN
    CFileInfo const info(original.getFullName(true));
    return !info.exists() || info.isFolder() != copy.isFolder();
    ERROR_BLOCK_END
}

// The copy's date is that of its making, so a later change of the original is newer than it.
bool isCurrent(CFileSpec const& original, CFileSpec const& copy) {
    if (!copy.exists())
        return false;
    CFileInfo const from = original.getFileInfo();
    CFileInfo const to = copy.getFileInfo();
    return from.isFolder() || (from.getFileSize() == to.getFileSize() &&
                               !(to.getModificationDate() < from.getModificationDate()));
}

// The walk follows links: neither folder may hold one to a folder elsewhere, or the other side's
// part of it is mirrored and deleted as well.
void mirror(CFileSpec const& source, CFileSpec const& target) {
    // Raises where there is no source: a disk that was taken out must not empty its mirror.
    source.getFileInfo();
    // Deletes first, so that no folder stands in the place of a file.
    forEachEntry(target, [&](CFileSpec const& copy, Strings::string const& name) {
        if (!hasGone(source + name, copy))
            return;
        FileSys::deleteFile(copy, true);
        ERROR_LOG(TLoggerMirror, Error::TTgtLogger, Error::TSevInfo, "deleted @(name)",
                  ERROR_PARAM(name));
    });
    forEachEntry(source, [&](CFileSpec const& original, Strings::string const& name) {
        CFileSpec const copy = target + name;
        if (isCurrent(original, copy))
            return;
        if (original.isFolder())
            FileSys::createFolder(copy);
        else
            FileSys::copyFile(original, copy, true);
        ERROR_LOG(TLoggerMirror, Error::TTgtLogger, Error::TSevInfo, "copied @(name)",
                  ERROR_PARAM(name));
    });
}

void write(CFileSpec const& file, char const* text) {
    unsigned int const mode = std::ios_base::trunc;
    Streams::Detail::basic_ofstreamW<char>(file.getFullName(true).c_str(), mode) << text;
}

// Without the place in the sources in which each line ends: it depends on the machine.
void print(char const* title, std::string const& log) {
    std::cout << title << '\n';
    std::istringstream lines(log);
    for (std::string line; std::getline(lines, line);)
        std::cout << line.substr(0, line.rfind(" (")) << '\n';
}

} // namespace

int main() {
    // Its owner deletes a folder with all in it.
    FileSys::CTempFile const place(
        FileSys::createTempFolder(FileSys::getTempPathName() + L"mirror"));
    CFileSpec const source = place.getFileSpec() + L"letters";
    CFileSpec const target = place.getFileSpec() + L"copies";

    std::ostringstream log;
    Error::CStreamLogTarget const logTarget(log);
    Error::CLogSingleton::addTarget<Error::TTgtLogger, Error::TSevInfo>(&logTarget);
    Error::CLogSingleton::addTarget<Error::TTgtLogger, Error::TSevWarn>(&logTarget);
    auto const run = [&](char const* title) {
        log.str("");
        mirror(source, target);
        print(title, log.str());
    };

    FileSys::createFolder(source + L"archive/2020");
    write(source + L"ada.txt", "Dear Ada");
    write(source + L"archive/2020/may.txt", "Dear May");
    run("first run");

    write(source + L"ada.txt", "Dear Ada, thank you");
    write(source + L"charles.txt", "Dear Charles");
    write(source + L"joan.txt", "Dear Joan");
    FileSys::deleteFile(source + L"archive/2020", true);
    write(source + L"archive/2021.txt", "None");
    // Somebody has moved this copy to another disk, which is not there now.
    std::string const link = (target + L"joan.txt").getFullName<std::string>(true);
    if (symlink("disk/joan.txt", link.c_str()) != 0)
        return 1;
    run("after changes");
    run("once more");

    Error::CLogSingleton::removeTarget<Error::TTgtLogger, Error::TSevInfo>(&logTarget);
    Error::CLogSingleton::removeTarget<Error::TTgtLogger, Error::TSevWarn>(&logTarget);
}
