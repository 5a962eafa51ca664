#include "hosts/windows/registry/windows_registry.hpp"

#include <algorithm>
#include <utility>

#include "hosts/windows/registry/win32.hpp"

namespace quabble {
namespace {

constexpr DWORD patience = 1000;  // milliseconds, for another program that writes

// Keeps others from the registry as long as it lives. A program that ends lets go of it.
class Turn {
 public:
    explicit Turn(const std::wstring& key) {
        std::wstring name = key;
        std::ranges::replace(name, L'\\', L'/');
        mutex_ = CreateMutexW(nullptr, FALSE, (L"Local\\" + name).c_str());
        const DWORD result = mutex_ == nullptr ? WAIT_FAILED : WaitForSingleObject(mutex_, patience);
        isOurs_ = result == WAIT_OBJECT_0 || result == WAIT_ABANDONED;
    }
    ~Turn() {
        if (isOurs_)
            ReleaseMutex(mutex_);
        if (mutex_ != nullptr)
            CloseHandle(mutex_);
    }
    Turn(const Turn&) = delete;
    Turn& operator=(const Turn&) = delete;

    bool isOurs() const { return isOurs_; }

 private:
    HANDLE mutex_ = nullptr;
    bool isOurs_ = false;
};

bool isAlike(std::wstring_view left, std::wstring_view right) {
    return !WithoutCase()(left, right) && !WithoutCase()(right, left);
}

}  // namespace

class WindowsRegistryStore::Transaction final : public RegistryTransaction {
 public:
    Transaction(const WindowsRegistryStore& store, RegistryTree kept, Access access)
        : store_(store), before_(std::move(kept)), after_(before_), canChange_(access == Access::Write) {}

    bool createKey(std::string_view path, std::string_view classString) override {
        const auto below = store_.pathBelow(path);
        canChange_ = canChange_ && below;
        if (!canChange_)
            return false;
        for (std::size_t end = 0; end < below->size(); end = below->find(L'\\', end + 1))
            after_.keys.try_emplace(below->substr(0, end));
        after_.keys.try_emplace(*below, RegistryTree::Key{registryNameOf(classString), {}});
        return true;
    }

    std::optional<RegistryValue> query(std::string_view key, std::string_view name) override {
        const RegistryTree::Key* found = find(key);
        if (found == nullptr)
            return std::nullopt;
        const auto value = found->values.find(registryNameOf(name));
        if (value == found->values.end())
            return std::nullopt;
        const auto& [type, data] = value->second;
        return RegistryValue{static_cast<ValueType>(type), type == REG_SZ ? bytesOfRegistryText(data) : data};
    }

    bool set(std::string_view key, std::string_view name, ValueType type,
             std::span<const std::byte> data) override {
        RegistryTree::Key* found = find(key);
        canChange_ = canChange_ && found != nullptr;
        if (canChange_) {
            const bool isText = type == ValueType::String;
            found->values[registryNameOf(name)] = {
                static_cast<std::uint32_t>(type),
                isText ? registryTextOf(data) : std::vector<std::byte>(data.begin(), data.end())};
        }
        return canChange_;
    }

    bool commit() override { return std::exchange(canChange_, false) && store_.replace(before_, after_); }

 private:
    RegistryTree::Key* find(std::string_view path) {
        const auto below = store_.pathBelow(path);
        const auto found = below ? after_.keys.find(*below) : after_.keys.end();
        return found == after_.keys.end() ? nullptr : &found->second;
    }

    const WindowsRegistryStore& store_;
    RegistryTree before_;
    RegistryTree after_;
    bool canChange_;
};

WindowsRegistryStore::WindowsRegistryStore(HKEY root, std::string_view key)
    : root_(root),
      key_(registryNameOf(key)),
      parent_(key_.substr(0, key_.rfind(L'\\'))),
      name_(key_.substr(key_.rfind(L'\\') + 1)),
      newName_(name_ + L" (new)"),
      oldName_(name_ + L" (old)") {}

std::unique_ptr<RegistryTransaction> WindowsRegistryStore::begin(Access access) {
    const Turn turn(key_);
    if (!turn.isOurs() || !open(key_.substr(0, key_.find(L'\\'))))
        return nullptr;
    const OpenRegistryKey parent = open(parent_);
    if (parent && !recover(parent.get()))
        return nullptr;
    auto kept = parent ? readRegistryTree(parent.get(), name_) : RegistryTree();
    return kept ? std::make_unique<Transaction>(*this, std::move(*kept), access) : nullptr;
}

OpenRegistryKey WindowsRegistryStore::open(const std::wstring& path) const {
    HKEY opened = nullptr;
    RegOpenKeyExW(root_, path.c_str(), 0, KEY_ALL_ACCESS, &opened);
    return OpenRegistryKey(opened);
}

std::optional<std::wstring> WindowsRegistryStore::pathBelow(std::string_view key) const {
    const std::wstring path = registryNameOf(key);
    if (!isAlike(path.substr(0, key_.size()), key_))
        return std::nullopt;
    if (path.size() == key_.size())
        return L"";
    return path[key_.size()] == L'\\' ? std::optional(path.substr(key_.size() + 1)) : std::nullopt;
}

// As long as the key itself is there it is the one that counts. Without it a program was stopped between the
// two renamings, when the new one was whole, or in the midst of writing the very first one, which nobody
// misses.
bool WindowsRegistryStore::recover(HKEY parent) const {
    if (!hasRegistryKey(parent, name_) && hasRegistryKey(parent, oldName_)) {
        const std::wstring& whole = hasRegistryKey(parent, newName_) ? newName_ : oldName_;
        if (RegRenameKey(parent, whole.c_str(), name_.c_str()) != ERROR_SUCCESS)
            return false;
    }
    for (const std::wstring& left : {newName_, oldName_}) {
        if (hasRegistryKey(parent, left) && RegDeleteTreeW(parent, left.c_str()) != ERROR_SUCCESS)
            return false;
    }
    return true;
}

bool WindowsRegistryStore::replace(const RegistryTree& before, const RegistryTree& after) const {
    const Turn turn(key_);
    if (!turn.isOurs())
        return false;
    HKEY opened = nullptr;
    RegCreateKeyExW(root_, parent_.c_str(), 0, nullptr, 0, KEY_ALL_ACCESS, nullptr, &opened, nullptr);
    const OpenRegistryKey parent(opened);
    if (!parent || !recover(opened) || readRegistryTree(opened, name_) != before)
        return false;
    if (after == before)
        return true;
    if (writeRegistryTree(opened, newName_, after) && swap(opened, !before.keys.empty())) {
        RegDeleteTreeW(opened, oldName_.c_str());
        return true;
    }
    RegDeleteTreeW(opened, newName_.c_str());
    recover(opened);
    return false;
}

// Puts the new key in the place of the old one, if there is one.
bool WindowsRegistryStore::swap(HKEY parent, bool hasOld) const {
    if (hasOld && RegRenameKey(parent, name_.c_str(), oldName_.c_str()) != ERROR_SUCCESS)
        return false;
    return RegRenameKey(parent, newName_.c_str(), name_.c_str()) == ERROR_SUCCESS;
}

}  // namespace quabble
