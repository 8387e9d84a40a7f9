// Settings beside other stores of settings, and beside the bare calls of the operating system.
//
// Every contender reads what is stored now, as another process may have just changed it, and leaves
// what it writes with the operating system. None waits for the disk, but QSettings, which can't
// help it; the time that it waits is no CPU time.

#include "2System/SysInfo/SysInfo.h"

#include "support/Benchmark.h"

#ifdef QORN_HAVE_GLIB
#    include <glib.h>
#endif
#ifdef QORN_HAVE_QT
#    include <QByteArray>
#    include <QSettings>
#    include <QString>
#    include <QStringList>
#endif
#ifdef QORN_HAVE_SQLITE
#    include <sqlite3.h>
#endif

#include <dirent.h>
#include <fcntl.h>
#include <sys/stat.h>
#include <sys/xattr.h>
#include <unistd.h>

#include <algorithm>
#include <cstddef>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <iostream>
#include <memory>
#include <random>
#include <string>
#include <utility>
#include <vector>

namespace {

using SysInfo::CPreferenceFolder;
using SysInfo::CSystemPrefs;
using SysInfo::CSystemPrefsPath;
using SysInfo::TByteVector;

using TNames = std::vector<std::string>;

// A folder for all that is stored, gone at the end of the program.
class CScratch {
  public:
    CScratch() {
        std::string name = std::filesystem::temp_directory_path() / "qorn-benchmark-XXXXXX";
        if (mkdtemp(name.data()) == nullptr) {
            std::perror(name.c_str());
            std::exit(EXIT_FAILURE);
        }
        path_ = name;
        setenv("XDG_CONFIG_HOME", path_.c_str(), 1);
    }
    ~CScratch() {
        std::error_code ignored;
        std::filesystem::remove_all(path_, ignored);
    }
    CScratch(CScratch const&) = delete;
    CScratch& operator=(CScratch const&) = delete;

    std::string path(std::string const& name) const { return path_ + "/" + name; }

    CPreferenceFolder open(std::string const& name) const {
        return CPreferenceFolder(CSystemPrefs::ekUser, CSystemPrefs::erWrite,
                                 CSystemPrefsPath(name), true, nullptr);
    }

    static CScratch const& get() {
        static CScratch const scratch;
        return scratch;
    }

  private:
    std::string path_;
};

// Text, since not all of the contenders can store bytes.
std::string randomText(std::size_t size) {
    std::mt19937 random(64);
    std::uniform_int_distribution<int> letter('a', 'z');
    std::string text(size, ' ');
    std::generate(text.begin(), text.end(), [&] { return static_cast<char>(letter(random)); });
    return text;
}

// A store with one value in it. Each of the classes below opens it for the whole measurement, as
// far as there is something to keep open.
constexpr char key[] = "size";

// As deep below the folder as a store of ours.
class CCalls {
  public:
    explicit CCalls(std::string const& name)
        : folder_(CScratch::get().path("Library/Preferences/" + name)), file_(folder_ + "/" + key) {
        std::filesystem::create_directories(folder_);
    }

    std::string read() const {
        std::string text;
        int const file = open(file_.c_str(), O_RDONLY | O_CLOEXEC);
        char chunk[8192];
        for (ssize_t count = 0; (count = ::read(file, chunk, sizeof(chunk))) > 0;)
            text.append(chunk, static_cast<std::size_t>(count));
        close(file);
        return text;
    }

    // What a preference folder promises of a write: the folder is made and seen to be there, the
    // file is rewritten in place, hidden, and open to all.
    void write(std::string const& text) const {
        struct stat status;
        if (stat(folder_.c_str(), &status) != 0 && mkdir(folder_.c_str(), 0777) != 0)
            std::abort();
        if (stat(folder_.c_str(), &status) != 0)
            std::abort();
        int const file = open(file_.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0666);
        writeAll(file, text);
        setxattr(file_.c_str(), "user.hidden", "1", 1, 0);
        stat(file_.c_str(), &status);
        chmod(file_.c_str(), status.st_mode | 0666U);
        close(file);
    }

    // Beside the file, and then in its place.
    void replace(std::string const& text) const {
        std::string const temporary = file_ + ".tmp";
        int const file = open(temporary.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0666);
        writeAll(file, text);
        close(file);
        std::rename(temporary.c_str(), file_.c_str());
    }

    void put(std::string const& name) const {
        close(open((folder_ + "/" + name).c_str(), O_WRONLY | O_CREAT | O_CLOEXEC, 0666));
    }
    void save() const {}

    TNames list() const {
        TNames names;
        DIR* const directory = opendir(folder_.c_str());
        while (dirent const* const entry = readdir(directory)) {
            if (entry->d_type == DT_REG)
                names.emplace_back(entry->d_name);
        }
        closedir(directory);
        std::sort(names.begin(), names.end());
        return names;
    }

  private:
    static void writeAll(int file, std::string const& text) {
        if (::write(file, text.data(), text.size()) != static_cast<ssize_t>(text.size()))
            std::abort();
    }

    std::string folder_;
    std::string file_;
};

class COurs {
  public:
    explicit COurs(std::string const& name)
        : store_(std::make_shared<CPreferenceFolder>(CScratch::get().open(name))) {}

    TByteVector read() const {
        TByteVector value;
        return std::move(store_->getValue(path_, key_, value));
    }
    void write(TByteVector const& value) const { store_->setValue(path_, key_, value); }

    void put(std::string const& name) const { store_->setValue(path_, name, TByteVector()); }
    void save() const {}
    TNames list() const { return store_->getValues(); }

  private:
    std::shared_ptr<CPreferenceFolder> store_;
    CSystemPrefsPath path_;
    std::string key_ = key;
};

#ifdef QORN_HAVE_QT
class CQt {
  public:
    explicit CQt(std::string const& name)
        : settings_(std::make_shared<QSettings>(
              QString::fromStdString(CScratch::get().path(name + ".ini")), QSettings::IniFormat)) {}

    QByteArray read() const {
        settings_->sync();
        return settings_->value(key).toByteArray();
    }
    void write(QByteArray const& value) const {
        settings_->setValue(key, value);
        settings_->sync();
    }
    void put(std::string const& name) const {
        settings_->setValue(QString::fromStdString(name), QByteArray("value"));
    }
    void save() const { settings_->sync(); }
    QStringList list() const {
        settings_->sync();
        return settings_->childKeys();
    }

  private:
    std::shared_ptr<QSettings> settings_;
};
#endif

#ifdef QORN_HAVE_GLIB
class CGlib {
  public:
    explicit CGlib(std::string const& name)
        : file_(CScratch::get().path(name + ".key")), keys_(g_key_file_new(), g_key_file_free) {}

    std::string read() const {
        load_();
        std::unique_ptr<char, void (*)(void*)> const text(
            g_key_file_get_string(keys_.get(), group, key, nullptr), g_free);
        return text.get();
    }
    void write(std::string const& value) const {
        put(key, value);
        save();
    }
    void put(std::string const& name, std::string const& value = "value") const {
        g_key_file_set_string(keys_.get(), group, name.c_str(), value.c_str());
    }
    void save() const { g_key_file_save_to_file(keys_.get(), file_.c_str(), nullptr); }

    TNames list() const {
        load_();
        char** const keys = g_key_file_get_keys(keys_.get(), group, nullptr, nullptr);
        TNames names;
        for (char** name = keys; *name != nullptr; ++name)
            names.emplace_back(*name);
        g_strfreev(keys);
        std::sort(names.begin(), names.end());
        return names;
    }

  private:
    static constexpr char group[] = "Window";

    void load_() const {
        g_key_file_load_from_file(keys_.get(), file_.c_str(), G_KEY_FILE_NONE, nullptr);
    }

    std::string file_;
    std::shared_ptr<GKeyFile> keys_;
};
#endif

#ifdef QORN_HAVE_SQLITE
class CSqlite {
  public:
    explicit CSqlite(std::string const& name) {
        sqlite3* database = nullptr;
        sqlite3_open(CScratch::get().path(name + ".sqlite").c_str(), &database);
        database_.reset(database, sqlite3_close);
        run_("PRAGMA journal_mode = WAL");
        run_("PRAGMA synchronous = OFF");
        run_("CREATE TABLE settings (key TEXT PRIMARY KEY, value BLOB) WITHOUT ROWID");
        select_ = prepare_("SELECT value FROM settings WHERE key = ?");
        replace_ = prepare_("INSERT OR REPLACE INTO settings VALUES (?, ?)");
        list_ = prepare_("SELECT key FROM settings ORDER BY key");
    }

    std::string read() const {
        sqlite3_bind_text(select_.get(), 1, key, -1, SQLITE_STATIC);
        sqlite3_step(select_.get());
        std::string const value(static_cast<char const*>(sqlite3_column_blob(select_.get(), 0)),
                                static_cast<std::size_t>(sqlite3_column_bytes(select_.get(), 0)));
        sqlite3_reset(select_.get());
        return value;
    }
    void write(std::string const& value) const { put(key, value); }

    void put(std::string const& name, std::string const& value = "value") const {
        sqlite3_bind_text(replace_.get(), 1, name.c_str(), -1, SQLITE_STATIC);
        sqlite3_bind_blob(replace_.get(), 2, value.data(), static_cast<int>(value.size()),
                          SQLITE_STATIC);
        sqlite3_step(replace_.get());
        sqlite3_reset(replace_.get());
    }
    void save() const {}

    TNames list() const {
        TNames names;
        while (sqlite3_step(list_.get()) == SQLITE_ROW)
            names.emplace_back(reinterpret_cast<char const*>(sqlite3_column_text(list_.get(), 0)));
        sqlite3_reset(list_.get());
        return names;
    }

  private:
    using TStatement = std::shared_ptr<sqlite3_stmt>;

    void run_(char const* text) const {
        sqlite3_exec(database_.get(), text, nullptr, nullptr, nullptr);
    }
    TStatement prepare_(char const* text) const {
        sqlite3_stmt* statement = nullptr;
        sqlite3_prepare_v2(database_.get(), text, -1, &statement, nullptr);
        return TStatement(statement, sqlite3_finalize);
    }

    // The statements go first.
    std::shared_ptr<sqlite3> database_;
    TStatement select_;
    TStatement replace_;
    TStatement list_;
};
#endif

template <class TBytes>
bool isSame(TBytes const& bytes, std::string const& text) {
    return static_cast<std::size_t>(bytes.size()) == text.size() &&
           std::equal(text.begin(), text.end(), bytes.begin(),
                      [](char left, auto right) { return left == static_cast<char>(right); });
}

void require(bool isRight, std::string const& row, std::string const& contender) {
    if (isRight)
        return;
    std::cerr << row << ": " << contender << " gives another result\n";
    std::exit(EXIT_FAILURE);
}

// Writes once, and checks what can be read then.
template <class TValue, class TWrite, class TRead>
void addWriting(std::string const& contender, std::string const& text, TWrite const& write,
                TRead const& read) {
    std::string const row = "PreferenceWrite/" + std::to_string(text.size());
    TValue const value(text.begin(), text.end());
    write(value);
    require(isSame(read(), text), row, contender);
    Benchmarks::add(row, contender, [write, value] {
        write(value);
        return 0;
    });
}

// The same, and reading as well.
template <class TValue, class TWrite, class TRead>
void addWritingAndReading(std::string const& contender, std::string const& text,
                          TWrite const& write, TRead const& read) {
    addWriting<TValue>(contender, text, write, read);
    Benchmarks::add("PreferenceRead/" + std::to_string(text.size()), contender, read);
}

template <class TValue, class TStore>
void addStore(std::string const& contender, std::string const& text, TStore const& store) {
    addWritingAndReading<TValue>(
        contender, text, [store](TValue const& value) { store.write(value); },
        [store] { return store.read(); });
}

void addStores(std::size_t size) {
    std::string const text = randomText(size);
    std::string const name = "Store" + std::to_string(size);

    addStore<TByteVector>("ours", text, COurs(name));
    addStore<std::string>("calls", text, CCalls("Calls" + name));
    CCalls const renamed("Renamed" + name);
    addWriting<std::string>(
        "rename", text, [renamed](std::string const& value) { renamed.replace(value); },
        [renamed] { return renamed.read(); });
#ifdef QORN_HAVE_QT
    CQt const qt(name);
    addWritingAndReading<std::string>(
        "qt", text, [qt](std::string const& value) { qt.write(QByteArray::fromStdString(value)); },
        [qt] { return qt.read(); });
#endif
#ifdef QORN_HAVE_GLIB
    addStore<std::string>("glib", text, CGlib(name));
#endif
#ifdef QORN_HAVE_SQLITE
    addStore<std::string>("sqlite", text, CSqlite(name));
#endif
}

// Listing.

TNames namesOf(TNames const& names) {
    return names;
}

#ifdef QORN_HAVE_QT
TNames namesOf(QStringList const& names) {
    TNames converted;
    for (QString const& name : names)
        converted.push_back(name.toStdString());
    return converted;
}
#endif

template <class TList>
void addListing(std::string const& contender, TNames const& expected, TList const& list) {
    std::string const row = "PreferenceList/" + std::to_string(expected.size());
    require(namesOf(list()) == expected, row, contender);
    Benchmarks::add(row, contender, list);
}

// Puts the names into a store whose list then gives them in order.
template <class TStore>
void addStoreListing(std::string const& contender, TNames const& names, TStore const& store) {
    for (std::string const& name : names)
        store.put(name);
    store.save();
    TNames sorted = names;
    std::sort(sorted.begin(), sorted.end());
    addListing(contender, sorted, [store] { return store.list(); });
}

void addListings(int count) {
    TNames names;
    for (int i = 0; i < count; ++i)
        names.push_back("setting " + std::to_string(i * 7919 % count));
    addStoreListing("ours", names, COurs("List"));
    addStoreListing("calls", names, CCalls("CallsList"));
#ifdef QORN_HAVE_QT
    addStoreListing("qt", names, CQt("List"));
#endif
#ifdef QORN_HAVE_GLIB
    addStoreListing("glib", names, CGlib("List"));
#endif
#ifdef QORN_HAVE_SQLITE
    addStoreListing("sqlite", names, CSqlite("List"));
#endif
}

void addBenchmarks() {
    for (std::size_t const size : {std::size_t{16}, std::size_t{1000}, std::size_t{100000}})
        addStores(size);
    addListings(10000);
}

Benchmarks::CRegistrar const registrar(addBenchmarks);

} // namespace
