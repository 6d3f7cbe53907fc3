// The AutoLISP function (Lumvex short short string string string): browse for one drawing.
#pragma once

int RunLumvex();
