#pragma once

namespace lumora {

struct Deployment;
struct SessionState;

// Sets the client profile and the switches of the session from the deployment. The start page runs it when it loads,
// before it opens a web page and at each hand-over, which undoes what the service panel changed. DiskRoot must be set.
// ServerKey, the third of QuickSizes and the last six of SizeList have no default and keep what they hold, unless the
// deployment gives them.
void LoadDefaultProfile(SessionState& state, const Deployment& deployment);

} // namespace lumora
