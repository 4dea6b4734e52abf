#pragma once

namespace lumora {

struct Deployment;
struct SessionState;

// Sets the client profile and the switches of the session from the deployment; the start page runs it at its load,
// before a look at the web pages and at each hand-over, so whatever the service panel changed is undone. DiskRoot must
// stand. ServerKey, the third of QuickSizes and the last six of SizeList have no default and keep what they hold,
// unless the deployment gives them.
void LoadDefaultProfile(SessionState& state, const Deployment& deployment);

} // namespace lumora
