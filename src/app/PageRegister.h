#pragma once

namespace lumora {

class Files;
class MainWindow;
class PageChain;
struct Deployment;
struct Platform;
struct SessionState;

// Register all pages, and the view that shows each.
void registerPages(PageChain& chain, SessionState& state, const Platform& platform, const Deployment& deployment);
void registerViews(MainWindow& window, PageChain& chain, SessionState& state, const Files& files);

} // namespace lumora
