#pragma once

#include <cstddef>
#include <cstdint>
#include <deque>
#include <memory>
#include <string>
#include <unordered_map>

namespace tovimar {

class CXmlForm;
struct ObjectContents;

/// Loaded definitions of documented objects. Contents, index, web help and context ids of one run all ask
/// for the same files; while somebody holds the cache a file is parsed once, and a file whose bytes changed
/// is parsed again. Without a holder every load is a fresh one. Definitions of more than 16 MiB of files
/// together push the oldest out.
///
/// A loaded definition is shared: who changes one in memory without saving it calls `Forget`.
class DefinitionCache {
public:
    DefinitionCache();
    ~DefinitionCache();
    DefinitionCache(const DefinitionCache&) = delete;
    DefinitionCache& operator=(const DefinitionCache&) = delete;

    /// Keeps definitions from its making to its end; holders nest.
    class Holder {
    public:
        explicit Holder(DefinitionCache& cache) : cache_(cache) { ++cache_.holders_; }
        ~Holder() { cache_.Leave(); }
        Holder(const Holder&) = delete;
        Holder& operator=(const Holder&) = delete;

    private:
        DefinitionCache& cache_;
    };

    /// Null when the file is missing or doesn't load.
    std::shared_ptr<CXmlForm> Load(const std::string& path);
    /// Writes the definition over the file; later loads give this one. False when the write failed.
    bool Save(const std::shared_ptr<CXmlForm>& form, const std::string& path);
    void Forget(const std::string& path);

    /// What was noted of a definition since the cache is held; null when nothing was, or the definition was
    /// saved or forgotten since.
    std::shared_ptr<const ObjectContents> KnownContents(const std::string& path) const;
    /// Without a holder nothing is noted.
    std::shared_ptr<const ObjectContents> NoteContents(const std::string& path, ObjectContents contents);

private:
    struct Entry {
        std::shared_ptr<CXmlForm> form;
        std::size_t length = 0;
        std::uint64_t hash = 0;
    };

    void Leave();
    void Drop(const std::string& key);
    void Keep(const std::string& key, std::shared_ptr<CXmlForm> form, const std::string& bytes);

    int holders_ = 0;
    std::size_t bytes_ = 0;
    std::unordered_map<std::string, Entry> entries_;
    std::deque<std::string> order_;
    /// By the folded path. Small beside the definitions, so those of all objects are kept.
    std::unordered_map<std::string, std::shared_ptr<const ObjectContents>> contents_;
};

} // namespace tovimar
