#include "autoconfig/FormCfg.h"
#include "platform/events.h"

int main() {
  FormCfg JanelaPrincipal;
  JanelaPrincipal.Form_Load();
  JanelaPrincipal.Show();
  platform::RunEventLoop();
  return 0;
}
