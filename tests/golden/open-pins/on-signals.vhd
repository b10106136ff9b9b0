
library ieee;
use ieee.std_logic_1164.ALL;
use ieee.numeric_std.ALL;
library KORBAL;
use KORBAL.Kelements.ALL;

entity openpins is
   port ( A : in    std_logic);
end openpins;

architecture BEHAVIORAL of openpins is
   signal U1_D_openSignal  : std_logic_vector (3 downto 0);
   signal U2_I0_openSignal : std_logic;
   signal U3_I_openSignal  : std_logic;
   component BUF4
      port ( D : in    std_logic_vector (3 downto 0); 
             Q : out   std_logic_vector (3 downto 0));
   end component;
   
   component AND2
      port ( I0 : in    std_logic; 
             I1 : in    std_logic; 
             O  : out   std_logic);
   end component;
   
   component PAD
      port ( I  : in    std_logic; 
             IO : inout std_logic);
   end component;
   
begin
   U1 : BUF4
      port map (D(3 downto 0)=>U1_D_openSignal(3 downto 0),
                Q=>open);
   
   U2 : AND2
      port map (I0=>U2_I0_openSignal,
                I1=>A,
                O=>open);
   
   U3 : PAD
      port map (I=>U3_I_openSignal,
                IO=>open);
   
end BEHAVIORAL;

-- synopsys translate_off
configuration CFG_openpins of  openpins is
   for BEHAVIORAL
      for U2 : AND2
         use configuration WORK.CFG_AND2;
      end for;
      for U1 : BUF4
         use configuration WORK.CFG_BUF4;
      end for;
      for U3 : PAD
         use configuration WORK.CFG_PAD;
      end for;
   end for;
end CFG_openpins;
-- synopsys translate_on

