#include "support/FakeLab.h"

#include "common/HostFile.h"

#include <fstream>

namespace lumora {

namespace {

Failure refused(const QString& why) {
    return {Failure::Kind::Refused, why};
}

Failure cut() {
    return {Failure::Kind::Disconnected, u"the line was cut"_s};
}

class FakeConnection : public FtpConnection {
public:
    explicit FakeConnection(FakeLab& lab)
        : m_lab(lab)
        , m_aborts(lab.aborts) {}

    Result<void> setCurrentDirectory(const QString& directory) override {
        const std::lock_guard lock(m_lab.mutex);
        if (isCut())
            return cut();
        const QString target = directory.startsWith(u'/') ? directory.mid(1) : below(directory);
        if (!m_lab.folders.contains(target) || (m_lab.refusesEntry && target.contains(u'^')))
            return no(u"550 Failed to change directory."_s);
        m_here = target;
        return {};
    }

    Result<QString> currentDirectory() override {
        const std::lock_guard lock(m_lab.mutex);
        if (isCut())
            return cut();
        return u'/' + m_here;
    }

    Result<void> makeDirectory(const QString& name) override {
        const std::lock_guard lock(m_lab.mutex);
        if (isCut())
            return cut();
        if (isBroken(name) || m_lab.refusesFolders || m_lab.folders.contains(below(name)))
            return no(u"550 Create directory operation failed."_s);
        m_lab.folders[below(name)];
        return {};
    }

    Result<void> put(const HostPath& local, const QString& remoteName) override {
        std::unique_lock lock(m_lab.mutex);
        if (isCut())
            return cut();
        const Result<QByteArray> content = readWholeFile(local, remoteName, 1 << 30);
        if (!content)
            return Failure{Failure::Kind::NotFound, remoteName};
        if (isBroken(remoteName))
            return no(u"553 Could not create file."_s);
        m_lab.puts += remoteName;
        if (m_lab.onPut) {
            lock.unlock();
            m_lab.onPut(remoteName);
            lock.lock();
        }
        if (isCut()) { // meanwhile
            m_lab.folders[m_here][remoteName] = content->left(content->size() / 2);
            return cut();
        }
        for (FakeLab::PutFault& fault : m_lab.putFaults) {
            if ((!fault.name.isEmpty() && fault.name != remoteName) || !FakeLab::strikes(fault.times))
                continue;
            if (fault.cutAfter < 0)
                return no(u"553 Could not create file."_s);
            m_lab.folders[m_here][remoteName] = content->left(fault.cutAfter);
            m_cut = true;
            return Failure{fault.kind, remoteName};
        }
        if (remoteName == m_lab.heldOpen && m_lab.folders[m_here].contains(remoteName))
            return no(u"553 Could not create file."_s);
        const std::optional<QByteArray> stored =
            m_lab.stores ? m_lab.stores(remoteName, *content) : std::optional<QByteArray>(*content);
        if (stored)
            m_lab.folders[m_here][remoteName] = *stored;
        return {};
    }

    Result<void> get(const QString& remoteName, const HostPath& local) override {
        return get(remoteName, local, m_lab.convertsText);
    }
    Result<void> getExact(const QString& remoteName, const HostPath& local) override {
        return get(remoteName, local, false);
    }

    Result<void> remove(const QString& remoteName) override {
        const std::lock_guard lock(m_lab.mutex);
        if (isCut())
            return cut();
        if (m_lab.refusesDelete || m_lab.folders[m_here].erase(remoteName) == 0)
            return no(u"550 Delete operation failed."_s);
        return {};
    }

    Result<FtpListing> list(const QString& pattern, EmptyFolder empty) override {
        const std::lock_guard lock(m_lab.mutex);
        if (isCut() || FakeLab::strikes(m_lab.failedListings)) {
            m_cut = true;
            return cut();
        }
        if (isBroken(pattern))
            return no(u"550 No such file."_s).failure();
        FtpListing listing;
        if (m_lab.listsDots)
            listing.entries = {{u"."_s, true}, {u".."_s, true}};
        const QString prefix = m_here.isEmpty() ? QString() : m_here + u'/';
        for (const auto& [path, folder] : m_lab.folders) {
            if (path.mid(prefix.size()) != m_lab.hiddenFolder && !path.isEmpty() && path.startsWith(prefix) &&
                !path.mid(prefix.size()).contains(u'/'))
                listing.entries.push_back({path.mid(prefix.size()), true});
        }
        for (const auto& [name, bytes] : m_lab.folders[m_here])
            listing.entries.push_back(
                {name, false, m_lab.listsLengths ? std::optional<qint64>(bytes.size()) : std::nullopt});
        if (listing.entries.empty() && m_lab.refusesEmptyListings && empty == EmptyFolder::IsListed)
            return no(u"550 No files found."_s).failure();
        listing.refused = listing.entries.empty() && m_lab.refusesEmptyListings;
        if (m_here.contains(u'^'))
            listing.unread = m_lab.unreadLine;
        return listing;
    }

    Result<std::optional<qint64>> length(const QString& remoteName) override {
        const std::lock_guard lock(m_lab.mutex);
        if (isCut())
            return cut();
        ++m_lab.sizesAsked;
        const FakeLab::Folder& folder = m_lab.folders[m_here];
        return m_lab.tellsSize && folder.contains(remoteName) ? std::optional<qint64>(folder.at(remoteName).size())
                                                              : std::nullopt;
    }

    QString lastResponse() const override { return m_response; }

private:
    Result<void> get(const QString& remoteName, const HostPath& local, bool converts) {
        const FakeLab::Folder& folder = m_lab.folders[m_here];
        if (isCut() || !folder.contains(remoteName))
            return isCut() ? Result<void>(cut()) : no(u"550 Failed to open file."_s);
        QByteArray bytes = folder.at(remoteName);
        if (converts)
            bytes.replace("\r\n", "\n");
        std::ofstream(local, std::ios::binary).write(bytes.constData(), bytes.size());
        return {};
    }
    QString below(const QString& name) const { return m_here.isEmpty() ? name : m_here + u'/' + name; }
    bool isCut() const { return m_cut || m_lab.aborts != m_aborts; }
    static bool isBroken(const QString& name) {
        return name.contains(u'\r') || name.contains(u'\n') || name.contains(QChar(0));
    }
    Result<void> no(const QString& reply) {
        m_response = reply;
        return refused(reply);
    }

    FakeLab& m_lab;
    int m_aborts;
    QString m_here;
    QString m_response;
    bool m_cut = false;
};

} // namespace

bool FakeLab::strikes(int& counter) {
    if (counter > 0)
        --counter;
    else if (counter != always)
        return false;
    return true;
}

bool FakeLab::open() {
    return !strikes(deadOpens);
}

Result<std::unique_ptr<FtpConnection>> FakeLab::connectFtp(const QString&, const QString&, const QString&,
                                                           DataChannel channel) {
    const std::lock_guard lock(mutex);
    ++connects;
    lastChannel = channel;
    if (onConnect)
        onConnect(connects);
    if (strikes(deadConnects))
        return Failure{deadConnectKind, u"nobody answers"_s};
    if (strikes(refusedLogins))
        return refused(u"530 Login incorrect."_s);
    return std::unique_ptr<FtpConnection>(std::make_unique<FakeConnection>(*this));
}

Result<WebAnswer> FakeLab::fetch(const QString& url) {
    urls += url;
    if (onFetch)
        onFetch();
    return WebAnswer{"ok"};
}

} // namespace lumora
