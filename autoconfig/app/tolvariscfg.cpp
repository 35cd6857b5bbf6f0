#include "autoconfig/FormCfg.h"
#include "platform/events.h"

int main() {
  FormCfg janelaPrincipal;
  janelaPrincipal.Form_Load();
  janelaPrincipal.Show();
  platform::RunEventLoop();
  return 0;
}
