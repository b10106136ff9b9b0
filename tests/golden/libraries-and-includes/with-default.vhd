
library std;
library std;
use work.all;
use std.textio.all;
library ieee;
use ieee.std_logic_1164.ALL;
use ieee.numeric_std.ALL;
library KORBAL;
use KORBAL.Kelements.ALL;

entity libs is
   port ( A : in    std_logic; 
          Y : out   std_logic);
end libs;

architecture BEHAVIORAL of libs is
begin
   Y <= A;
end BEHAVIORAL;

-- synopsys translate_off
configuration CFG_libs of  libs is
   for BEHAVIORAL
   end for;
end CFG_libs;
-- synopsys translate_on

