
library ieee;
use ieee.std_logic_1164.ALL;
use ieee.numeric_std.ALL;
library KORBAL;
use KORBAL.Kelements.ALL;

entity again is
   port ( A : in    std_logic; 
          Q : out   std_logic; 
          Y : out   std_logic);
end again;

architecture BEHAVIORAL of again is
   signal Q_DUMMY          : std_logic;
   signal U1_I1_openSignal : std_logic;
   component AND2
      port ( I0 : in    std_logic; 
             I1 : in    std_logic; 
             O  : out   std_logic);
   end component;
   
begin
   Q <= Q_DUMMY;
   U1 : AND2
      port map (I0=>A,
                I1=>U1_I1_openSignal,
                O=>Q_DUMMY);
   
   U2 : AND2
      port map (I0=>A,
                I1=>Q_DUMMY,
                O=>Y);
   
   U3 : AND2
      port map (I0=>Q_DUMMY,
                I1=>A,
                O=>open);
   
end BEHAVIORAL;

-- synopsys translate_off
configuration CFG_again of  again is
   for BEHAVIORAL
      for U1, U2, U3 : AND2
         use configuration WORK.CFG_AND2;
      end for;
   end for;
end CFG_again;
-- synopsys translate_on

