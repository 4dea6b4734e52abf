#include "editing/tFrmNew.h"
namespace lumora {
void tFrmNew::load() {}
void tFrmNew::setTexts() {}
void tFrmNew::Command11_Click() {}
void tFrmNew::Timer2_Tick() {}
void tFrmNew::Timer3_Tick() {}
void tFrmNew::Timer6_Tick() {}
void tFrmNew::Timer7_Tick() {}
void tFrmNew::Timer8_Tick() {}
}
