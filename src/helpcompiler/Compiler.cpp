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

namespace tovimar::helpcompiler {
namespace fs = std::filesystem;
namespace {

/// Files that are read and looked through at a time.
constexpr std::size_t kBatch = 64;

std::string ReadWhole(const fs::path& path) {
    return platform::NativeFile(path.string(), O_RDONLY).ReadAll();
}

bool IsPage(const std::string& extension) {
    return extension == "htm" || extension == "html" || extension == "xhtml";
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
          page_(project_.help.codePage), container_(project_.help.language, 0, options.threads) {}

    CompileResult Run() {
        QueueListed();
        if (queue_.empty()) {
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
        for (std::size_t done = 0; done < queue_.size();)
            done = TakeBatch(done);
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
        if (queued_.insert(text::FoldCase(name)).second)
            queue_.push_back(name);
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

    std::size_t TakeBatch(std::size_t first) {
        std::vector<LoadedFile> files(std::min(kBatch, queue_.size() - first));
        // Conversions of double-byte code pages keep a state that threads can't share.
        const unsigned threads = IsDoubleByte(page_.Number()) ? 1 : ThreadCount(options_.threads);
        ForAll(files.size(), threads, [&](std::size_t i) { files[i] = Load(queue_[first + i]); });
        for (LoadedFile& file : files)
            TakeFile(file);
        return first + files.size();
    }

    LoadedFile Load(const std::string& name) const {
        LoadedFile file{name, ReadWhole(folder_.PathOf(name)), false, {}};
        const std::string extension = LowerExtension(name);
        file.isPage = IsPage(extension);
        if (file.isPage) {
            file.bytes = InCodePage(file.bytes, page_);
            file.content = ReadPage(file.bytes, page_);
        } else if (extension == "css") {
            file.content.references = ReadStyleSheet(file.bytes);
        }
        return file;
    }

    void TakeFile(const LoadedFile& file) {
        AddFile(file.name, file.bytes);
        for (const PageReference& reference : file.content.references)
            QueueTarget(file.name, reference, file.name);
        if (!file.isPage)
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

    void AddFile(const std::string& name, const std::string& bytes) {
        for (const char byte : name + bytes)
            stamp_ = (stamp_ ^ static_cast<unsigned char>(byte)) * 16777619U;
        if (!container_.Add("/" + StoredName(name), bytes))
            Complain(name, "' has a name that can't be stored");
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
        const std::string bytes = container_.Finish();
        const fs::path target = path_.parent_path() / project_.compiledFile;
        platform::NativeFile file = platform::NativeFile::TemporaryBeside(target.string());
        try {
            file.WriteAll(bytes);
            file.Close();
            fs::rename(file.Path(), target);
        } catch (...) {
            std::error_code ignored;
            fs::remove(file.Path(), ignored);
            throw;
        }
        result_.bytes = bytes.size();
        result_.file = target;
    }

    fs::path path_;
    CompileOptions options_;
    CompileResult result_;
    Tell tell_;
    ProjectFolder folder_;
    HelpProject project_;
    text::CodePage page_;
    Container container_;
    SearchIndex search_;
    std::vector<std::string> queue_;
    std::unordered_set<std::string> queued_;
    std::unordered_set<std::string> missing_; ///< told already
    std::uint32_t stamp_ = 2166136261U;
};

} // namespace

CompileResult Compile(const fs::path& project, const CompileOptions& options, const Tell& tell) {
    return Compilation(project, options, tell).Run();
}

} // namespace tovimar::helpcompiler
