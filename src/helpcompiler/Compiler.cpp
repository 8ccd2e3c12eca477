#include "helpcompiler/Compiler.h"

#include "helpcompiler/CodePageText.h"
#include "helpcompiler/Container.h"
#include "helpcompiler/HelpProject.h"
#include "helpcompiler/InternalFiles.h"
#include "helpcompiler/PageReader.h"
#include "helpcompiler/Threads.h"
#include "helpcompiler/WordTable.h"
#include "platform/files/NativeFile.h"

#include <fcntl.h>
#include <unordered_map>
#include <unordered_set>
#include <zlib.h>

namespace tovimar::helpcompiler {
namespace fs = std::filesystem;
namespace {

/// Pages that are read and looked through at a time: so many, and so many bytes of them.
constexpr std::size_t kBatch = 64;
constexpr std::uintmax_t kBatchBytes = std::uintmax_t{16} << 20;
/// Of files that are only stored.
constexpr std::size_t kPiece = std::size_t{1} << 20;

std::string ReadWhole(const fs::path& path) {
    return platform::NativeFile(path.string(), O_RDONLY).ReadAll();
}

bool IsPage(const std::string& extension) {
    return extension == "htm" || extension == "html" || extension == "xhtml";
}

/// Files that are compressed already.
bool IsPacked(const std::string& extension) {
    static const std::unordered_set<std::string> kPacked{"jpg", "jpeg", "png", "gif",
                                                         "zip", "webp", "mp3", "mp4"};
    return kPacked.contains(extension);
}

struct LoadedFile {
    std::string name;
    std::string bytes;
    bool isPage = false;
    PageContent content;
};

class Compilation {
public:
    Compilation(const fs::path& path, const CompileOptions& options, const Tell& tell)
        : path_(path), options_(options), tell_([this, &tell](const Message& message) {
              result_.complaints |= message.kind == Message::Kind::Complaint;
              tell(message);
          }),
          folder_(path.parent_path()),
          project_(ReadHelpProject(ReadWhole(path), path.filename().string(), folder_, tell_)),
          page_(project_.help.codePage), target_(fs::absolute(path).parent_path() / project_.compiledFile),
          container_(project_.help.language, 0, options.threads, target_.parent_path()) {}

    CompileResult Run() {
        QueueListed();
        if (queued_.empty()) {
            tell_({Message::Kind::Complaint, path_.filename().string(), 0, "lists no file that exists"});
            return result_;
        }
        project_.help.contents = TakeSitemap(project_.contentsFile, project_.help.contentsFile);
        project_.help.index = TakeSitemap(project_.indexFile, project_.help.indexFile);
        TakeStopList();
        FindDefaultTopic();
        CheckTargets(project_.help.contents, project_.contentsFile);
        CheckTargets(project_.help.index, project_.indexFile);
        CheckContexts();
        for (std::size_t done = 0; done < pages_.size();)
            done = TakeBatch(done);
        for (const std::string& name : others_)
            Store(name);
        container_.BeginPacked();
        for (const std::string& name : pictures_)
            Store(name);
        container_.EndPacked();
        AddInternalFiles();
        Write();
        return result_;
    }

private:
    void Complain(const std::string& file, const std::string& text) {
        tell_(
            {Message::Kind::Complaint, path_.filename().string(), project_.LineOf(file), "'" + file + text});
    }
    void ComplainOfMissing(const std::string& file) {
        Complain(file, "' is in the project but not on the disk");
    }
    void Warn(int line, const std::string& text) {
        tell_({Message::Kind::Warning, path_.filename().string(), line, text});
    }

    void Queue(const std::string& name) {
        if (!queued_.insert(text::FoldCase(name)).second)
            return;
        const std::string extension = LowerExtension(name);
        auto& queue = IsPage(extension) || extension == "css" ? pages_
                      : IsPacked(extension)                   ? pictures_
                                                              : others_;
        queue.push_back(name);
    }

    void QueueListed() {
        for (const std::string& file : project_.files) {
            if (const auto found = folder_.Find(file))
                Queue(*found);
            else
                ComplainOfMissing(file);
        }
    }

    /// Contents and index go in as they are found, in the help's code page.
    Sitemap TakeSitemap(const std::string& name, std::string& stored) {
        if (name.empty())
            return {};
        const auto found = folder_.Find(name);
        if (!found) {
            ComplainOfMissing(name);
            return {};
        }
        stored = page_.Encode(*found);
        const std::string bytes = InCodePage(ReadWhole(folder_.PathOf(*found)), page_);
        AddFile(*found, bytes);
        queued_.insert(text::FoldCase(*found));
        Sitemap map = ReadSitemap(bytes, page_);
        for (const UnheldText& unheld : map.unheld)
            tell_({Message::Kind::Warning, *found, unheld.line,
                   "'" + page_.Decode(unheld.value) + "' has characters beyond code page " +
                       std::to_string(page_.Number())});
        return map;
    }

    /// Words that are too common to be looked for, one a line.
    void TakeStopList() {
        if (project_.stopListFile.empty())
            return;
        const auto found = folder_.Find(project_.stopListFile);
        if (!found) {
            ComplainOfMissing(project_.stopListFile);
            return;
        }
        std::unordered_set<std::string> words;
        SplitWords(ReadWhole(folder_.PathOf(*found)), page_.Number(), [&](std::string_view word) {
            if (words.emplace(word).second)
                project_.help.stopWords.emplace_back(word);
        });
        search_.SetStopWords(std::move(words));
    }

    void FindDefaultTopic() {
        std::string& topic = project_.help.defaultTopic;
        if (const auto found = folder_.Find(page_.Decode(topic)))
            topic = page_.Encode(*found);
    }

    /// What contents and index lead to belongs to the help, listed or not.
    void CheckTargets(const Sitemap& map, const std::string& file) {
        for (const SitemapEntry& entry : map.entries)
            for (const SitemapTarget& target : TargetsOf(entry))
                QueueTarget({}, {PageReference::Kind::Needed, target.url, entry.line}, file);
    }

    void CheckContexts() {
        std::unordered_map<std::uint32_t, std::string> pageOf;
        std::vector<ContextTarget> good;
        for (const ContextTarget& context : project_.help.contexts) {
            const std::string target = page_.Decode(context.target);
            const std::string name = target.substr(0, target.find('#'));
            const auto found = folder_.Find(name);
            if (!found) {
                Warn(context.line, "'" + name + "' has a number but isn't on the disk");
                continue;
            }
            const std::string whole = *found + target.substr(name.size());
            const auto [first, isNew] = pageOf.try_emplace(context.id, whole);
            if (!isNew && first->second != whole)
                Warn(context.line, "the number " + std::to_string(context.id) + " stands for '" +
                                       first->second + "' and for '" + whole +
                                       "'; a program that asks for it gets the first");
            Queue(*found);
            if (isNew)
                good.push_back({context.id, page_.Encode(whole), context.line});
        }
        project_.help.contexts = std::move(good);
    }

    void QueueTarget(const std::string& page, const PageReference& reference, const std::string& told) {
        bool outside = false;
        const auto name = FileOfReference(page, page_.Decode(reference.target), outside);
        if (!name || name->empty())
            return;
        const auto found = outside ? std::nullopt : folder_.Find(*name);
        if (found)
            Queue(*found);
        else if (missing_.insert(told + "\n" + *name).second)
            tell_({Message::Kind::Warning, told, reference.line,
                   "'" + page_.Decode(reference.target) +
                       (outside ? "' leads out of the project" : "' isn't on the disk")});
    }

    void LeaveIfAsked() const {
        if (options_.stop())
            throw Interrupted();
    }

    std::size_t TakeBatch(std::size_t first) {
        LeaveIfAsked();
        std::vector<LoadedFile> files(PagesOfBatch(first));
        // Conversions of double-byte code pages keep a state that threads can't share.
        const unsigned threads = IsDoubleByte(page_.Number()) ? 1 : ThreadCount(options_.threads);
        ForAll(files.size(), threads, [&](std::size_t i) { files[i] = Load(pages_[first + i]); });
        for (LoadedFile& file : files)
            TakeFile(file);
        return first + files.size();
    }

    std::size_t PagesOfBatch(std::size_t first) const {
        std::uintmax_t bytes = 0;
        std::size_t count = 0;
        while (count < kBatch && first + count < pages_.size() && bytes < kBatchBytes) {
            std::error_code ignored;
            const auto size = fs::file_size(folder_.PathOf(pages_[first + count]), ignored);
            bytes += ignored ? 0 : size;
            ++count;
        }
        return count;
    }

    LoadedFile Load(const std::string& name) const {
        LoadedFile file{name, ReadWhole(folder_.PathOf(name)), false, {}};
        const std::string extension = LowerExtension(name);
        file.isPage = IsPage(extension);
        if (file.isPage) {
            file.bytes = InCodePage(file.bytes, page_);
            file.content = ReadPage(file.bytes, page_);
        } else {
            file.content.references = ReadStyleSheet(file.bytes);
        }
        return file;
    }

    void TakeFile(const LoadedFile& file) {
        const bool stored = AddFile(file.name, file.bytes);
        for (const PageReference& reference : file.content.references)
            QueueTarget(file.name, reference, file.name);
        if (!file.isPage || !stored)
            return;
        if (project_.help.fullTextSearch)
            search_.Add(static_cast<std::uint32_t>(project_.help.pages.size()), file.content.words);
        const std::string& title = file.content.title;
        project_.help.pages.push_back(
            {page_.Encode(StoredName(file.name)), title, !title.empty(), true, false});
    }

    /// A file above the project's folder is stored as if it lay in it.
    static std::string StoredName(std::string name) {
        while (name.starts_with("../"))
            name.erase(0, 3);
        return name;
    }

    /// Of a project's contents, for its stamp.
    void Stamp(std::string_view bytes) {
        stamp_ = static_cast<std::uint32_t>(
            crc32_z(stamp_, reinterpret_cast<const unsigned char*>(bytes.data()), bytes.size()));
    }

    bool AddFile(const std::string& name, const std::string& bytes) {
        Stamp(name);
        Stamp(bytes);
        return IsStored(name, container_.Add("/" + StoredName(name), bytes));
    }

    bool IsStored(const std::string& name, bool stored) {
        if (!stored)
            Complain(name, "' has a name that can't be stored");
        return stored;
    }

    /// A file that nothing is read from, in pieces.
    void Store(const std::string& name) {
        Stamp(name);
        const platform::NativeFile file(folder_.PathOf(name).string(), O_RDONLY);
        IsStored(name, container_.AddInPieces("/" + StoredName(name), [&] {
            LeaveIfAsked();
            std::string piece = file.ReadHere(kPiece);
            Stamp(piece);
            return piece;
        }));
    }

    void AddInternalFiles() {
        HelpDescription& help = project_.help;
        help.time = options_.time.value_or(stamp_);
        container_.SetTime(help.time);
        const TopicTables topics(help);
        result_.topics = topics.Topics().size();
        for (const InternalFile& file : MakeInternalFiles(help, topics, search_))
            container_.Add(file.name, file.bytes, file.compressed);
    }

    void Write() {
        platform::NativeFile file = platform::NativeFile::TemporaryBeside(target_.string());
        try {
            container_.Finish([&](std::string_view bytes) {
                LeaveIfAsked();
                file.WriteAll(bytes);
                result_.bytes += bytes.size();
            });
            file.Close();
            fs::rename(file.Path(), target_);
        } catch (...) {
            std::error_code ignored;
            fs::remove(file.Path(), ignored);
            throw;
        }
        result_.file = target_;
    }

    fs::path path_;
    CompileOptions options_;
    CompileResult result_;
    Tell tell_;
    ProjectFolder folder_;
    HelpProject project_;
    text::CodePage page_;
    fs::path target_; ///< absolute
    Container container_;
    SearchIndex search_;
    std::vector<std::string> pages_, others_, pictures_; ///< style sheets with the pages
    std::unordered_set<std::string> queued_;
    std::unordered_set<std::string> missing_; ///< told already
    std::uint32_t stamp_ = 0;
};

} // namespace

CompileResult Compile(const fs::path& project, const CompileOptions& options, const Tell& tell) {
    return Compilation(project, options, tell).Run();
}

} // namespace tovimar::helpcompiler
