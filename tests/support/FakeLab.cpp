#include "support/FakeLab.h"

#include <fstream>
#include <iterator>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

Failure refused(const QString& why) {
    return {Failure::Kind::Refused, why};
}

Failure cut() {
    return {Failure::Kind::Disconnected, u"the line was cut"_s};
}

// True as often as the counter says.
bool strikes(int& counter) {
    if (counter > 0)
        --counter;
    else if (counter != FakeLab::always)
        return false;
    return true;
}

class FakeConnection : public FtpConnection {
public:
    explicit FakeConnection(FakeLab& lab)
        : m_lab(lab) {}

    Result<void> setCurrentDirectory(const QString& directory) override {
        if (m_cut)
            return cut();
        const QString target = directory.startsWith(u'/') ? directory.mid(1) : below(directory);
        if (!m_lab.folders.contains(target) || (m_lab.refusesEntry && target.contains(u'^')))
            return refused(u"550 Failed to change directory."_s);
        m_here = target;
        return {};
    }

    Result<QString> currentDirectory() override {
        if (m_cut)
            return cut();
        return u'/' + m_here;
    }

    Result<void> makeDirectory(const QString& name) override {
        if (m_cut)
            return cut();
        if (m_lab.refusesFolders || m_lab.folders.contains(below(name)))
            return refused(u"550 Create directory operation failed."_s);
        m_lab.folders[below(name)];
        return {};
    }

    Result<void> put(const HostPath& local, const QString& remoteName) override {
        if (m_cut)
            return cut();
        m_lab.puts += remoteName;
        if (m_lab.onPut)
            m_lab.onPut(remoteName);
        std::ifstream in(local, std::ios::binary);
        const std::string bytes((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());
        QByteArray content = QByteArray::fromStdString(bytes);
        for (FakeLab::PutFault& fault : m_lab.putFaults) {
            if ((!fault.name.isEmpty() && fault.name != remoteName) || !strikes(fault.times))
                continue;
            if (fault.cutAfter < 0)
                return refused(u"553 Could not create file."_s);
            m_lab.folders[m_here][remoteName] = content.left(fault.cutAfter);
            m_cut = true;
            return cut();
        }
        m_lab.folders[m_here][remoteName] = content;
        return {};
    }

    Result<void> get(const QString& remoteName, const HostPath& local) override {
        const FakeLab::Folder& folder = m_lab.folders[m_here];
        if (m_cut || !folder.contains(remoteName))
            return m_cut ? cut() : refused(u"550 Failed to open file."_s);
        const QByteArray& bytes = folder.at(remoteName);
        std::ofstream(local, std::ios::binary).write(bytes.constData(), bytes.size());
        return {};
    }

    Result<void> remove(const QString& remoteName) override {
        if (m_cut)
            return cut();
        m_lab.deletes += remoteName;
        if (m_lab.refusesDelete || m_lab.folders[m_here].erase(remoteName) == 0)
            return refused(u"550 Delete operation failed."_s);
        return {};
    }

    Result<std::vector<FtpEntry>> list(const QString&) override {
        if (m_cut || strikes(m_lab.failedListings)) {
            m_cut = true;
            return cut();
        }
        std::vector<FtpEntry> entries;
        if (m_lab.listsDots)
            entries = {{u"."_s, true}, {u".."_s, true}};
        const QString prefix = m_here.isEmpty() ? QString() : m_here + u'/';
        for (const auto& [path, folder] : m_lab.folders) {
            if (!path.isEmpty() && path.startsWith(prefix) && !path.mid(prefix.size()).contains(u'/'))
                entries.push_back({path.mid(prefix.size()), true});
        }
        for (const auto& [name, bytes] : m_lab.folders[m_here])
            entries.push_back({name, false});
        return entries;
    }

    QString lastResponse() const override { return {}; }

private:
    QString below(const QString& name) const { return m_here.isEmpty() ? name : m_here + u'/' + name; }

    FakeLab& m_lab;
    QString m_here;
    bool m_cut = false;
};

} // namespace

bool FakeLab::open() {
    return !strikes(deadOpens);
}

Result<std::unique_ptr<FtpConnection>> FakeLab::connectFtp(const QString&, const QString&, const QString&,
                                                           DataChannel channel) {
    ++connects;
    lastChannel = channel;
    if (onConnect)
        onConnect(connects);
    if (strikes(deadConnects))
        return cut();
    if (strikes(refusedLogins))
        return refused(u"530 Login incorrect."_s);
    return std::unique_ptr<FtpConnection>(std::make_unique<FakeConnection>(*this));
}

Result<QByteArray> FakeLab::fetch(const QString& url) {
    urls += url;
    return QByteArray("ok");
}

Result<QByteArray> FakeLab::post(const QString& url, const PostRequest&) {
    urls += url;
    return QByteArray("ok");
}

Result<void> FakeLab::download(const QString& url, const HostPath& target) {
    urls += url;
    std::ofstream(target, std::ios::binary) << "ok";
    return {};
}

} // namespace lumora
