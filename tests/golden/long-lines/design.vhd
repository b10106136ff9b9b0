
library ieee;
use ieee.std_logic_1164.ALL;
use ieee.numeric_std.ALL;
library KORBAL;
use KORBAL.Kelements.ALL;

entity long is
   port ( A                                                            : in    
         std_logic; 
          P_XXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXX : out   
         std_logic_vector (7 downto 0));
end long;

architecture BEHAVIORAL of long is
   attribute NOTE  : string ;
   attribute PATH  : string ;
   attribute WORDS : string ;
   signal B_XXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXX 
                                                           : std_logic_vector 
         (3 downto 0);
   signal C_XXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXX 
                                                           : std_logic_vector 
         (3 downto 0);
   signal F_XXXXXXXXXXXXXXXXXXXXXXXXXX 
                                                                       : 
         std_logic;
   signal G_XXXXXXXXXXXXXXXXXXXXXXXXXX 
                                                                       : 
         std_logic;
   signal H_XXXXXXXXXXXXXXXXXXXXXXXXXX 
                                                                       : 
         std_logic;
   signal K_XXXXXXXXXXXXXXXXXXXXXXXXXX 
                                                                       : 
         std_logic;
   signal M_XXXXXXXXXXXXXXXXXXXXXXXXXXXX 
                                                                     : 
         std_logic_vector (7 downto 0);
   signal 
         
         N_XXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXX 
         : std_logic;
   component BUF4
      port ( D : in    std_logic_vector (3 downto 0); 
             Q : out   std_logic_vector (3 downto 0));
   end component;
   
   component TITLED
      generic( TITLE : string :=  
            "v_XXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXX");
      port ( I : in    std_logic; 
             O : out   std_logic);
   end component;
   
   attribute NOTE of M_XXXXXXXXXXXXXXXXXXXXXXXXXXXX : signal is 
         "v_XXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXX";
   attribute PATH of M_XXXXXXXXXXXXXXXXXXXXXXXXXXXX : signal is 
         "a/b_XXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXX";
   attribute WORDS of M_XXXXXXXXXXXXXXXXXXXXXXXXXXXX : signal is 
         "v_XXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXX w w";
begin
   K_XXXXXXXXXXXXXXXXXXXXXXXXXX <= '1';
   P_XXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXX(7 downto 0) <= 
         M_XXXXXXXXXXXXXXXXXXXXXXXXXXXX(7 downto 0);
   I_BUFFER_NUMBER_01 : BUF4
      port map (D(3)=>F_XXXXXXXXXXXXXXXXXXXXXXXXXX,
                D(2)=>G_XXXXXXXXXXXXXXXXXXXXXXXXXX,
                D(1)=>H_XXXXXXXXXXXXXXXXXXXXXXXXXX,
                D(0)=>K_XXXXXXXXXXXXXXXXXXXXXXXXXX,
                Q=>open);
   
   I_BUFFER_NUMBER_02 : BUF4
      port map (D(3 downto 0)=>B_XXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXX(3 
            downto 0),
                Q(3 downto 0)=>C_XXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXX(3 
            downto 0));
   
   I_BUFFER_NUMBER_03 : BUF4
      port map (D(3 downto 0)=>B_XXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXX(3 
            downto 0),
                Q=>open);
   
   I_BUFFER_NUMBER_04 : BUF4
      port map (D(3 downto 0)=>B_XXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXX(3 
            downto 0),
                Q=>open);
   
   I_BUFFER_NUMBER_05 : BUF4
      port map (D(3 downto 0)=>B_XXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXX(3 
            downto 0),
                Q=>open);
   
   I_BUFFER_NUMBER_06 : BUF4
      port map (D(3 downto 0)=>B_XXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXX(3 
            downto 0),
                Q=>open);
   
   U_TITLED : TITLED
   generic map( TITLE => 
         "v_XXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXX2")
      port map (I=>A,
                
            
            
            O=>N_XXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXXX);
   
end BEHAVIORAL;

-- synopsys translate_off
configuration CFG_long of  long is
   for BEHAVIORAL
      for I_BUFFER_NUMBER_01, I_BUFFER_NUMBER_02, I_BUFFER_NUMBER_03, 
            I_BUFFER_NUMBER_04, I_BUFFER_NUMBER_05, I_BUFFER_NUMBER_06 : BUF4
         use configuration WORK.CFG_BUF4;
      end for;
      for U_TITLED : TITLED
         use configuration WORK.CFG_TITLED;
      end for;
   end for;
end CFG_long;
-- synopsys translate_on

